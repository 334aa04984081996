#include <VizBridge/stepinput/StepGdtReferences.h>

#include <TDF_LabelSequence.hxx>
#include <TopExp_Explorer.hxx>
#include <TopoDS_TShape.hxx>
#include <XCAFDoc_DimTolTool.hxx>
#include <XCAFDoc_DocumentTool.hxx>
#include <XCAFDoc_ShapeTool.hxx>

#include <unordered_set>

namespace VizBridgeStep {

void StepGdtReferences::Check(Handle(TDocStd_Document) const& xcaf,
                              std::vector<StepPart> const& parts, StepCounts& counts,
                              std::vector<std::string>& notes) {
    // Faces by topology, whatever their place and orientation in the object's reference.
    std::unordered_set<TopoDS_TShape const*> partFaces;
    for (StepPart const& part : parts)
        for (int face = 1; face <= part.faces.Extent(); ++face)
            partFaces.insert(part.faces(face).TShape().get());

    Handle(XCAFDoc_DimTolTool) const tool = XCAFDoc_DocumentTool::DimTolTool(xcaf->Main());
    TDF_LabelSequence objects;
    for (auto const list :
         {&XCAFDoc_DimTolTool::GetDimensionLabels, &XCAFDoc_DimTolTool::GetGeomToleranceLabels,
          &XCAFDoc_DimTolTool::GetDatumLabels}) {
        TDF_LabelSequence some;
        ((*tool).*list)(some);
        objects.Append(some);
    }
    int unresolved = 0;
    for (TDF_Label const& object : objects) {
        ++counts.gdtObjects;
        TDF_LabelSequence first, second;
        if (!tool->GetRefShapeLabel(object, first, second))
            continue;
        first.Append(second);
        for (TDF_Label const& shapeLabel : first) {
            TopoDS_Shape const shape = XCAFDoc_ShapeTool::GetShape(shapeLabel);
            for (TopExp_Explorer face(shape, TopAbs_FACE); face.More(); face.Next()) {
                ++counts.gdtFaceReferences;
                if (partFaces.count(face.Current().TShape().get()) > 0)
                    ++counts.gdtResolvedFaces;
                else
                    ++unresolved;
            }
        }
    }
    if (unresolved > 0)
        notes.push_back(std::to_string(unresolved) +
                        " face references of the file's GD&T name no face of a part");
}

} // namespace VizBridgeStep

#pragma once

#include <VizBridge/stepinput/StepDocument.h>

#include <TDF_Label.hxx>
#include <TDocStd_Document.hxx>
#include <XCAFDoc_ColorTool.hxx>
#include <XCAFDoc_ShapeTool.hxx>

#include <map>
#include <string>
#include <utility>
#include <vector>

namespace VizBridgeStep {

/// Turns the product structure that Open CASCADE transferred into its XCAF document into
/// references and instances of the import library's model, and the parts' BREP into
/// StepParts.
///
/// A product whose components are all the reader's made-up ones (named "=>[...]" and placed
/// at identity: the representation items of one product, such as its solid and a compound of
/// supplemental geometry) is one part. A product that has such items beside real components
/// gets its own geometry as a part of its own, placed once at identity.
///
/// Points at the document, the model, the parts, the counts and the notes that it fills; all
/// must outlive it.
class StepStructureReader {
public:
    StepStructureReader(Handle(TDocStd_Document) const& document, TarvexModel& model,
                        std::vector<StepPart>& parts, StepCounts& counts,
                        std::vector<std::string>& notes);

    /// Walks the free shapes. `productName` names the product when the file's top is no single
    /// assembly.
    void Read(VizPort::WString const& productName);

    /// The reference id given to the shape label `label`, or 0.
    unsigned int ReferenceIdOf(TDF_Label const& label) const;

private:
    /// The reference of `label` (a part or assembly label), made on first use.
    unsigned int reference(TDF_Label const& label);
    unsigned int addPart(TDF_Label const& label, VizPort::WString const& name,
                         std::vector<TDF_Label> const& items);
    /// Places the components of assembly `label` below reference `parentId`.
    void placeComponents(TDF_Label const& label, unsigned int parentId);
    void describe(TarvexAuthoredInstance& instance, TDF_Label const& component) const;
    bool isMadeUp(TDF_Label const& component) const;
    /// The sub-shapes of `label` that the file colours, with their colours.
    void collectColoredSubShapes(
        TDF_Label const& label,
        std::vector<std::pair<TopoDS_Shape, std::array<std::uint8_t, 3>>>& out) const;

    Handle(XCAFDoc_ShapeTool) m_shapes;
    Handle(XCAFDoc_ColorTool) m_colors;
    TarvexModel& m_model;                               ///< not owned
    std::vector<StepPart>& m_parts;                     ///< not owned
    StepCounts& m_counts;                               ///< not owned
    std::vector<std::string>& m_notes;                  ///< not owned
    std::map<std::string, unsigned int> m_referenceIds; ///< label entry to reference id
    unsigned int m_nextId = 1;
};

} // namespace VizBridgeStep

#include <VizBridge/stepinput/StepStructureReader.h>

#include <VizBridge/stepinput/StepText.h>

#include <BRep_Builder.hxx>
#include <Quantity_Color.hxx>
#include <TDF_LabelSequence.hxx>
#include <TDF_Tool.hxx>
#include <TopExp.hxx>
#include <TopExp_Explorer.hxx>
#include <TopLoc_Location.hxx>
#include <TopoDS_Compound.hxx>
#include <XCAFDoc_DocumentTool.hxx>
#include <gp_Trsf.hxx>

#include <algorithm>
#include <cmath>
#include <utility>

namespace VizBridgeStep {

namespace {

std::string entryOf(TDF_Label const& label) {
    TCollection_AsciiString entry;
    TDF_Tool::Entry(label, entry);
    return entry.ToCString();
}

std::array<std::uint8_t, 3> srgbBytes(Quantity_Color const& color) {
    // XCAF keeps colours linear; the file and a viewer speak sRGB.
    double red = 0, green = 0, blue = 0;
    color.Values(red, green, blue, Quantity_TOC_sRGB);
    auto const byte = [](double value) {
        return static_cast<std::uint8_t>(std::lround(std::clamp(value, 0.0, 1.0) * 255.0));
    };
    return {byte(red), byte(green), byte(blue)};
}

std::optional<std::array<std::uint8_t, 3>> colorOf(Handle(XCAFDoc_ColorTool) const& tool,
                                                   TDF_Label const& label) {
    Quantity_Color color;
    if (tool->GetColor(label, XCAFDoc_ColorSurf, color) ||
        tool->GetColor(label, XCAFDoc_ColorGen, color) ||
        tool->GetColor(label, XCAFDoc_ColorCurv, color))
        return srgbBytes(color);
    return std::nullopt;
}

bool hasFaces(TopoDS_Shape const& shape) {
    return !shape.IsNull() && TopExp_Explorer(shape, TopAbs_FACE).More();
}

bool hasLooseGeometry(TopoDS_Shape const& shape) {
    return !shape.IsNull() && (TopExp_Explorer(shape, TopAbs_EDGE, TopAbs_FACE).More() ||
                               TopExp_Explorer(shape, TopAbs_VERTEX, TopAbs_EDGE).More());
}

} // namespace

StepStructureReader::StepStructureReader(Handle(TDocStd_Document) const& document,
                                         TarvexModel& model, std::vector<StepPart>& parts,
                                         StepCounts& counts, std::vector<std::string>& notes)
    : m_shapes(XCAFDoc_DocumentTool::ShapeTool(document->Main())),
      m_colors(XCAFDoc_DocumentTool::ColorTool(document->Main())), m_model(model), m_parts(parts),
      m_counts(counts), m_notes(notes) {}

void StepStructureReader::Read(VizPort::WString const& productName) {
    TDF_LabelSequence free;
    m_shapes->GetFreeShapes(free);
    // A single real assembly on top is the product: its components are the root instances.
    if (free.Length() == 1 && m_shapes->IsAssembly(free(1))) {
        TDF_LabelSequence components;
        m_shapes->GetComponents(free(1), components);
        bool madeUpOnly = true;
        for (int i = 1; i <= components.Length(); ++i)
            madeUpOnly = madeUpOnly && isMadeUp(components(i));
        if (!madeUpOnly) {
            VizPort::WString const name = LabelName(free(1));
            m_model.SetProductName(name.empty() ? productName : name);
            placeComponents(free(1), 0);
            return;
        }
    }
    m_model.SetProductName(productName);
    for (int i = 1; i <= free.Length(); ++i) {
        unsigned int const id = reference(free(i));
        if (id == 0)
            continue;
        VizPort::WString const name = LabelName(free(i));
        m_model.AddRootInstance(id, name.empty() ? productName : name);
        ++m_counts.instances;
    }
}

unsigned int StepStructureReader::ReferenceIdOf(TDF_Label const& label) const {
    auto const found = m_referenceIds.find(entryOf(label));
    return found == m_referenceIds.end() ? 0 : found->second;
}

bool StepStructureReader::isMadeUp(TDF_Label const& component) const {
    VizPort::WString const name = LabelName(component);
    return name.rfind(u"=>", 0) == 0 && m_shapes->GetLocation(component).IsIdentity();
}

unsigned int StepStructureReader::reference(TDF_Label const& label) {
    if (unsigned int const known = ReferenceIdOf(label))
        return known;
    VizPort::WString const name = LabelName(label);
    if (!m_shapes->IsAssembly(label)) {
        if (!hasFaces(m_shapes->GetShape(label)) && !hasLooseGeometry(m_shapes->GetShape(label)))
            return 0; // nothing to show: no reference
        return addPart(label, name, {label});
    }

    TDF_LabelSequence components;
    m_shapes->GetComponents(label, components);
    std::vector<TDF_Label> items;
    for (int i = 1; i <= components.Length(); ++i) {
        TDF_Label referred;
        if (isMadeUp(components(i)) && m_shapes->GetReferredShape(components(i), referred))
            items.push_back(referred);
    }
    if (!items.empty() && static_cast<int>(items.size()) == components.Length())
        return addPart(label, name, items);

    unsigned int const id = m_nextId++;
    m_referenceIds[entryOf(label)] = id;
    m_model.AddAssembly(id, name);
    ++m_counts.assemblies;
    placeComponents(label, id);
    return id;
}

unsigned int StepStructureReader::addPart(TDF_Label const& label, VizPort::WString const& name,
                                          std::vector<TDF_Label> const& items) {
    unsigned int const id = m_nextId++;
    m_referenceIds[entryOf(label)] = id;
    StepPart part;
    part.referenceId = id;
    part.name = VizPort::Narrow(name);
    BRep_Builder builder;
    TopoDS_Compound body;
    TopoDS_Compound loose;
    builder.MakeCompound(body);
    builder.MakeCompound(loose);
    bool hasBody = false;
    bool hasLoose = false;
    std::vector<std::pair<TopoDS_Shape, std::array<std::uint8_t, 3>>> colored;
    for (TDF_Label const& item : items) {
        TopoDS_Shape const shape = m_shapes->GetShape(item);
        if (hasFaces(shape)) {
            builder.Add(body, shape);
            hasBody = true;
            collectColoredSubShapes(item, colored);
            if (!part.color)
                part.color = colorOf(m_colors, item);
        } else if (hasLooseGeometry(shape)) {
            builder.Add(loose, shape);
            hasLoose = true;
        }
    }
    if (!part.color)
        part.color = colorOf(m_colors, label);
    if (hasBody) {
        part.shape = body;
        TopExp::MapShapes(part.shape, TopAbs_FACE, part.faces);
        TopExp::MapShapes(part.shape, TopAbs_EDGE, part.edges);
        for (auto const& [shape, color] : colored) {
            for (TopExp_Explorer face(shape, TopAbs_FACE); face.More(); face.Next())
                if (int const index = part.faces.FindIndex(face.Current()))
                    part.faceColors[index] = color;
        }
    }
    if (hasLoose)
        part.supplemental = loose;
    m_parts.push_back(std::move(part));
    m_model.AddPart(id, name);
    ++m_counts.parts;
    m_counts.faces += m_parts.back().faces.Extent();
    return id;
}

void StepStructureReader::collectColoredSubShapes(
    TDF_Label const& label,
    std::vector<std::pair<TopoDS_Shape, std::array<std::uint8_t, 3>>>& out) const {
    TDF_LabelSequence subShapes;
    m_shapes->GetSubShapes(label, subShapes);
    for (int i = 1; i <= subShapes.Length(); ++i) {
        std::optional<std::array<std::uint8_t, 3>> const color = colorOf(m_colors, subShapes(i));
        TopoDS_Shape const shape = m_shapes->GetShape(subShapes(i));
        if (color && !shape.IsNull())
            out.emplace_back(shape, *color);
    }
}

void StepStructureReader::placeComponents(TDF_Label const& label, unsigned int parentId) {
    TDF_LabelSequence components;
    m_shapes->GetComponents(label, components);
    std::vector<TDF_Label> ownItems;
    for (int i = 1; i <= components.Length(); ++i) {
        TDF_Label referred;
        if (!m_shapes->GetReferredShape(components(i), referred))
            continue;
        if (isMadeUp(components(i))) {
            ownItems.push_back(referred);
            continue;
        }
        unsigned int const id = reference(referred);
        if (id == 0) {
            m_notes.push_back("component " + VizPort::Narrow(LabelName(components(i))) +
                              " shows nothing and is left out");
            continue;
        }
        VizPort::WString name = LabelName(components(i));
        if (name.empty())
            name = LabelName(referred);
        TarvexAuthoredInstance& instance = parentId == 0 ? m_model.AddRootInstance(id, name)
                                                         : m_model.AddInstance(parentId, id, name);
        describe(instance, components(i));
        ++m_counts.instances;
    }
    if (ownItems.empty())
        return;
    // An assembly with geometry of its own: that geometry is a part placed at identity.
    VizPort::WString const name = LabelName(label) + u" geometry";
    unsigned int const partId = addPart(ownItems.front(), name, ownItems);
    if (parentId == 0)
        m_model.AddRootInstance(partId, name);
    else
        m_model.AddInstance(parentId, partId, name);
    ++m_counts.instances;
}

void StepStructureReader::describe(TarvexAuthoredInstance& instance,
                                   TDF_Label const& component) const {
    gp_Trsf const trsf = m_shapes->GetLocation(component).Transformation();
    TarvexPlacement placement;
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column)
            placement.rotation[row][column] = trsf.Value(row + 1, column + 1);
        placement.translation[row] = trsf.Value(row + 1, 4);
    }
    instance.placement = placement;
    if (std::optional<std::array<std::uint8_t, 3>> const color = colorOf(m_colors, component))
        instance.rgb = std::array<unsigned short, 3>{(*color)[0], (*color)[1], (*color)[2]};
    if (!m_colors->IsVisible(component))
        instance.hidden = true;
}

} // namespace VizBridgeStep

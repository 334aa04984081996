#include "SampleAssembly.h"

#include "SampleBox.h"

#include <array>
#include <vector>

namespace VizBridgeExamples {

namespace {

/// A placement that only moves, by `x`, `y` and `z` millimetres.
TarvexPlacement Translation(double x, double y, double z) {
    TarvexPlacement placement;
    placement.translation[0] = x;
    placement.translation[1] = y;
    placement.translation[2] = z;
    return placement;
}

/// A placement turned a quarter turn about the z axis, then moved.
TarvexPlacement QuarterTurnAboutZ(double x, double y, double z) {
    TarvexPlacement placement = Translation(x, y, z);
    placement.rotation[0][0] = 0;
    placement.rotation[0][1] = -1;
    placement.rotation[1][0] = 1;
    placement.rotation[1][1] = 0;
    return placement;
}

using Point = std::array<float, 3>;
using VizPort::WString;

/// Lines through `points` in order, as PMI and wires draw them; indices are float offsets.
TarvexAuthoredVisuEdge Lines(std::vector<Point> const& points,
                             TarvexVisuLineType type = TarvexVisuLine_Polyline) {
    TarvexAuthoredVisuEdge edge;
    edge.lineType = type;
    std::vector<int> indices;
    for (Point const& point : points) {
        indices.push_back(static_cast<int>(edge.points.size()));
        edge.points.insert(edge.points.end(), point.begin(), point.end());
    }
    edge.lineIndices = std::move(indices);
    return edge;
}

/// A text that reads along x, in a plane seen from the front (its normal is -y).
TarvexAuthoredVisuText FrontText(char16_t const* text, Point anchor) {
    TarvexAuthoredVisuText authored;
    authored.text = text;
    authored.anchor = anchor;
    authored.direction = {1, 0, 0};
    authored.normal = {0, -1, 0};
    return authored;
}

/// A link from a PMI to what shows a face in the same part's visualisation data.
TarvexAuthoredEntity LinkTo(WString const& visualId) {
    TarvexAuthoredEntity entity;
    entity.visualId = visualId;
    return entity;
}

TarvexAuthoredVisuNode Group(TarvexVisuNode::TarvexVisuNodeType type) {
    TarvexAuthoredVisuNode node;
    node.type = type;
    node.leaf = false;
    return node;
}

TarvexAuthoredVisuNode Leaf(TarvexVisuNode::TarvexVisuNodeType type) {
    TarvexAuthoredVisuNode node;
    node.type = type;
    return node;
}

TarvexAuthoredVisuNode PMILeaf(TarvexVisuNode::TarvexVisuNodeType type, char16_t const* name,
                               char16_t const* id) {
    TarvexAuthoredVisuNode node = Leaf(type);
    node.pmi.displayName = name;
    node.pmi.id = id;
    node.pmi.mechanicalId = WString(u"PMI:") + id;
    return node;
}

constexpr unsigned int kBracketFirstEntity = SampleAssembly::kBracketFirstFaceId;
constexpr unsigned int kBoltFirstEntity = 200;
constexpr unsigned int kCoverFirstEntity = 300;
SampleBox const kBracketBox(60, 20, 10);
SampleBox const kBoltBox(6, 6, 30);

/// The Bracket's tessellated data: its mesh, the axis of its holes as constructed geometry,
/// the hole centres as points, three PMI (the flatness tolerance hidden), a view and a
/// capture. The root's font reaches every text that has none of its own.
TarvexAuthoredVisuData BracketVisualisation() {
    TarvexAuthoredVisuData visu;
    visu.unit = TarvexLengthUnit_Millimeter;

    TarvexAuthoredVisuNode root = Group(TarvexVisuNode::VisuRoot);
    root.attributes.font = TarvexAuthoredVisuFont{u"DejaVu Sans", 3.5f, 1.0f, 1.0f};
    visu.nodes.push_back(root);
    visu.nodes.push_back(Group(TarvexVisuNode::VisuBody));

    TarvexAuthoredVisuNode mesh = Leaf(TarvexVisuNode::VisuMesh);
    mesh.mesh = kBracketBox.Mesh(u"Bracket", kBracketFirstEntity);
    mesh.attributes.rgb = std::array<unsigned short, 3>{150, 150, 160};
    visu.nodes.push_back(mesh);

    TarvexAuthoredVisuNode axes = Leaf(TarvexVisuNode::VisuWire);
    axes.wire.id = u"Bracket.HoleAxes";
    axes.wire.geometryType = TarvexVisuGeometry_Constructed;
    axes.wire.edges = {Lines({{15, 10, -5}, {15, 10, 15}}), Lines({{45, 10, -5}, {45, 10, 15}})};
    visu.nodes.push_back(axes);

    TarvexAuthoredVisuNode centres = Leaf(TarvexVisuNode::VisuPointSet);
    TarvexAuthoredVisuPoints holes;
    holes.points = {15, 10, 10, 45, 10, 10};
    holes.pointIndices = std::vector<int>{0, 3};
    holes.rgb = std::array<unsigned short, 3>{250, 200, 0};
    centres.pointSet.points.push_back(holes);
    visu.nodes.push_back(centres);

    TarvexAuthoredVisuNode length =
        PMILeaf(TarvexVisuNode::VisuDimensionDistance, u"Length 60", u"Bracket.PMI1");
    length.pmi.edges = {Lines({{0, 0, 10}, {0, 0, 22}}), Lines({{60, 0, 10}, {60, 0, 22}}),
                        Lines({{0, 0, 20}, {60, 0, 20}})};
    length.pmi.texts = {FrontText(u"60", {27, 0, 21})};
    length.pmi.linkedElements = {LinkTo(SampleBox::FaceId(u"Bracket", 6)),
                                 LinkTo(SampleBox::FaceId(u"Bracket", 5))};
    visu.nodes.push_back(length);

    TarvexAuthoredVisuNode note = PMILeaf(TarvexVisuNode::VisuNote, u"Hole note", u"Bracket.PMI2");
    note.pmi.edges = {Lines({{45, 10, 10}, {62, 10, 30}, {70, 10, 30}})};
    note.pmi.texts = {FrontText(u"2X M6 THRU", {71, 10, 29})};
    note.pmi.linkedElements = {LinkTo(SampleBox::FaceId(u"Bracket", 2))};
    visu.nodes.push_back(note);

    TarvexAuthoredVisuNode flatness =
        PMILeaf(TarvexVisuNode::VisuGeomTolFlatness, u"Flatness", u"Bracket.PMI3");
    flatness.attributes.hidden = true;
    flatness.pmi.edges = {Lines({{10, 0, -12}, {30, 0, -12}, {30, 0, -6}, {10, 0, -6}},
                                TarvexVisuLine_ClosedPolyline),
                          Lines({{20, 0, -6}, {20, 0, 0}})};
    flatness.pmi.texts = {FrontText(u"0.05", {12, 0, -10.5f})};
    flatness.pmi.linkedElements = {LinkTo(SampleBox::FaceId(u"Bracket", 1))};
    visu.nodes.push_back(flatness);

    TarvexAuthoredVisuView front;
    front.displayName = u"Front";
    front.id = u"Bracket.View1";
    front.axis = TarvexVisuTriples{{{0, 0, 0}, {1, 0, 0}, {0, 0, 1}}};
    front.annotationIds = {u"Bracket.PMI1", u"Bracket.PMI2"};
    visu.views.push_back(front);

    TarvexAuthoredVisuCapture inspection;
    inspection.displayName = u"Inspection";
    inspection.id = u"Bracket.Capture1";
    inspection.active = true;
    inspection.camera.type = TarvexVisuCamera::CameraPerspective;
    inspection.camera.orientation = TarvexVisuTriples{{{30, -120, 60}, {30, 10, 5}, {0, 0, 1}}};
    inspection.camera.perspectiveViewAngle = 0.7f;
    inspection.annotationIds = {u"Bracket.PMI1", u"Bracket.PMI3"};
    visu.captures.push_back(inspection);
    return visu;
}

/// The Bolt's tessellated data: its mesh, coloured steel, and a note in a font of its own.
TarvexAuthoredVisuData BoltVisualisation() {
    TarvexAuthoredVisuData visu;
    visu.unit = TarvexLengthUnit_Millimeter;
    visu.nodes.push_back(Group(TarvexVisuNode::VisuRoot));

    TarvexAuthoredVisuNode mesh = Leaf(TarvexVisuNode::VisuMesh);
    mesh.mesh = kBoltBox.Mesh(u"Bolt", kBoltFirstEntity);
    mesh.attributes.rgb = std::array<unsigned short, 3>{180, 180, 190};
    visu.nodes.push_back(mesh);

    TarvexAuthoredVisuNode thread = PMILeaf(TarvexVisuNode::VisuNote, u"Thread", u"Bolt.PMI1");
    thread.pmi.edges = {Lines({{3, 0, 25}, {12, 0, 34}})};
    TarvexAuthoredVisuText text = FrontText(u"M6x30", {13, 0, 33});
    text.font = TarvexAuthoredVisuFont{u"DejaVu Sans Mono", 2.5f, 1.0f, 1.0f};
    thread.pmi.texts = {text};
    thread.pmi.linkedElements = {LinkTo(SampleBox::FaceId(u"Bolt", 2))};
    visu.nodes.push_back(thread);
    return visu;
}

} // namespace

SampleAssembly::SampleAssembly() {
    m_model.SetProductName(u"SampleProduct");
    m_model.SetUnits(TarvexLengthUnit_Millimeter);
    addDocument();
    addReferences();
    addInstances();
    // The import reports the files it could not open by full path; the storage name of
    // the Cover is the last part of it.
    m_model.AddMissingFile(u"C:\\VizBridge\\Samples\\Parts\\Cover.prt");
}

void SampleAssembly::addDocument() {
    TarvexAuthoredDocument& document = m_model.Document();
    document.fileName = u"SampleProduct.asm";
    document.author = u"VizBridge examples";
    document.organization = u"VizBridge";
    document.sourceSystem = u"TarvexModel authoring";
    document.version = u"1.0";
    document.unit = u"mm";
    document.comment = u"Bundled sample assembly";
    document.formatType = u"Assembly";
}

void SampleAssembly::addReferences() {
    m_model.AddAssembly(kBracketAssemblyId, u"BracketAssembly", u"BracketAssembly.asm");
    TarvexAuthoredReference& bracket = m_model.AddPart(kBracketId, u"Bracket", u"Bracket.prt");
    bracket.geometry = kBracketBox.Brep(kBracketFirstEntity);
    bracket.visu = BracketVisualisation();
    TarvexAuthoredReference& bolt = m_model.AddPart(kBoltId, u"Bolt", u"Bolt.prt");
    bolt.geometry = kBoltBox.Brep(kBoltFirstEntity);
    bolt.visu = BoltVisualisation();
    m_model.AddPart(kCoverId, u"Cover", u"Cover.prt").geometry =
        SampleBox(80, 40, 2).Brep(kCoverFirstEntity);
}

void SampleAssembly::addInstances() {
    TarvexAuthoredInstance& assembly =
        m_model.AddRootInstance(kBracketAssemblyId, u"BracketAssembly.1");
    assembly.placement = Translation(0, 0, 50);

    TarvexAuthoredInstance& bracket =
        m_model.AddInstance(kBracketAssemblyId, kBracketId, u"Bracket.1");
    bracket.rgb = std::array<unsigned short, 3>{220, 40, 40};

    TarvexAuthoredInstance& firstBolt = m_model.AddInstance(kBracketAssemblyId, kBoltId, u"Bolt.1");
    firstBolt.placement = Translation(-20, 0, 10);
    firstBolt.rgb = std::array<unsigned short, 3>{180, 180, 190};
    firstBolt.alpha = 128;

    TarvexAuthoredInstance& secondBolt =
        m_model.AddInstance(kBracketAssemblyId, kBoltId, u"Bolt.2");
    secondBolt.placement = QuarterTurnAboutZ(20, 0, 10);
    secondBolt.hidden = true;

    TarvexAuthoredInstance& cover = m_model.AddRootInstance(kCoverId, u"Cover.1");
    cover.placement = Translation(0, 0, 120);
}

} // namespace VizBridgeExamples

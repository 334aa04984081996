#include "examples/SampleAssembly.h"

#include <array>

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

/// A box part of `sx` by `sy` by `sz` millimetres from the origin: six faces of two
/// triangles (entity ids `firstId` to `firstId + 5`) and its twelve edges (the next ids).
TarvexAuthoredPartGeometry Cuboid(float sx, float sy, float sz, unsigned int firstId) {
    float const corners[8][3] = {{0, 0, 0},  {sx, 0, 0},  {sx, sy, 0},  {0, sy, 0},
                                 {0, 0, sz}, {sx, 0, sz}, {sx, sy, sz}, {0, sy, sz}};
    // Each face by its four corners, counter-clockwise seen from outside.
    unsigned int const faces[6][4] = {{0, 3, 2, 1}, {4, 5, 6, 7}, {0, 1, 5, 4},
                                      {2, 3, 7, 6}, {1, 2, 6, 5}, {0, 4, 7, 3}};
    unsigned int const edges[12][2] = {{0, 1}, {1, 2}, {2, 3}, {3, 0}, {4, 5}, {5, 6},
                                       {6, 7}, {7, 4}, {0, 4}, {1, 5}, {2, 6}, {3, 7}};
    TarvexAuthoredPartGeometry geometry;
    unsigned int id = firstId;
    for (auto const& face : faces) {
        TarvexAuthoredFace authored;
        authored.entityId = id++;
        for (unsigned int corner : face)
            authored.vertices.insert(authored.vertices.end(), corners[corner], corners[corner] + 3);
        authored.triangles = {0, 1, 2, 0, 2, 3};
        geometry.faces.push_back(std::move(authored));
    }
    for (auto const& edge : edges) {
        TarvexAuthoredEdge authored;
        authored.entityId = id++;
        for (unsigned int corner : edge)
            authored.points.insert(authored.points.end(), corners[corner], corners[corner] + 3);
        geometry.edges.push_back(std::move(authored));
    }
    return geometry;
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
    m_model.AddPart(kBracketId, u"Bracket", u"Bracket.prt").geometry = Cuboid(60, 20, 10, 100);
    m_model.AddPart(kBoltId, u"Bolt", u"Bolt.prt").geometry = Cuboid(6, 6, 30, 200);
    m_model.AddPart(kCoverId, u"Cover", u"Cover.prt").geometry = Cuboid(80, 40, 2, 300);
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

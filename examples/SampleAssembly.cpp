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
    m_model.AddPart(kBracketId, u"Bracket", u"Bracket.prt");
    m_model.AddPart(kBoltId, u"Bolt", u"Bolt.prt");
    m_model.AddPart(kCoverId, u"Cover", u"Cover.prt");
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

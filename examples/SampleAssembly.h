#pragma once

#include <VizBridge/contracts/tarvex/TarvexModel.h>

namespace VizBridgeExamples {

/// The bundled sample: a small assembly authored in memory through TarvexModel, so that the
/// demo host runs without any CAD file. Owns its model; the value objects that the model
/// hands out share its data and may outlive this object.
///
/// The Bracket and the Bolt carry both a BREP and tessellated visualisation data with PMI;
/// the Cover only a BREP, and its file is missing.
///
///     SampleProduct (unit mm)
///     +- BracketAssembly.1   sub-assembly "BracketAssembly"      id 10
///     |  +- Bracket.1        part "Bracket", red                  id 11
///     |  +- Bolt.1           part "Bolt", steel, half transparent id 12
///     |  +- Bolt.2           part "Bolt", hidden                  id 12
///     +- Cover.1             part "Cover", its file is missing    id 13
class SampleAssembly {
public:
    static constexpr unsigned int kBracketAssemblyId = 10;
    static constexpr unsigned int kBracketId = 11;
    static constexpr unsigned int kBoltId = 12;
    static constexpr unsigned int kCoverId = 13;
    /// The entity id of the Bracket's first face; its faces and edges follow.
    static constexpr unsigned int kBracketFirstFaceId = 100;

    SampleAssembly();

    TarvexModel const& GetModel() const { return m_model; }

private:
    void addDocument();
    void addReferences();
    void addInstances();

    TarvexModel m_model;
};

} // namespace VizBridgeExamples

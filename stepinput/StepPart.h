#pragma once

#include <TopTools_IndexedMapOfShape.hxx>
#include <TopoDS_Shape.hxx>

#include <array>
#include <cstdint>
#include <map>
#include <optional>
#include <string>

namespace VizBridgeStep {

/// One part of a STEP file as Open CASCADE gives it: the BREP that the modeler draws, and the
/// numbering of its faces and edges that every road shares. A face's entity id is its index
/// in `faces` (1 to N, in TopExp::MapShapes order); an edge's is kEdgeIdBase plus its index
/// in `edges`, so that faces and edges never share an id.
struct StepPart {
    static constexpr unsigned int kEdgeIdBase = 1u << 20;

    unsigned int referenceId = 0;
    std::string name;
    /// Solids and shells, in the part's own coordinates (millimetres).
    TopoDS_Shape shape;
    /// Supplemental geometry: loose edges and vertices; may be null.
    TopoDS_Shape supplemental;
    TopTools_IndexedMapOfShape faces;
    TopTools_IndexedMapOfShape edges;
    /// The part's colour, as sRGB bytes, if the file gives one.
    std::optional<std::array<std::uint8_t, 3>> color;
    /// Colours the file gives single faces, by face index.
    std::map<int, std::array<std::uint8_t, 3>> faceColors;

    unsigned int EdgeId(int index) const { return kEdgeIdBase + static_cast<unsigned int>(index); }
};

} // namespace VizBridgeStep

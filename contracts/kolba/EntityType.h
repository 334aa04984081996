#pragma once

#include <cstdint>

namespace KolbaVizCore {

/// Kinds of entity. The values double as tags of scene nodes.
enum EntityType : std::uint32_t {
    Vertex = 10000,
    Edge = 10001,
    Face = 10002,
    Body = 10003,
    Cloud = 10004,
    PMI = 10005,
    Vis = 10006,
    Group = 10007,
    Link = 10008,
    Text = 10009,
    Views = 10010,
    Captures = 10012,
    UnknownPMI = 10100,
    Note = 10101,
    Datum = 10102,
    Dimension = 10103,
    GeomTol = 10104,
    Roughness = 10105,
    FTAGeometry = 11000,
};

} // namespace KolbaVizCore

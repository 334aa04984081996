#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexVisuGeometryType.h>
#include <VizBridge/contracts/tarvex/TarvexVisuLineType.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPolygonType.h>

#include <array>
#include <optional>
#include <vector>

// The tessellated geometry of visualisation data as a host or test describes it. Coordinates
// are x, y, z per point; indices are offsets into those float arrays, so that the point k of
// an array has the index 3k. Absent index arrays read back as null arrays.

/// A polyline of an edge, mesh, wire, PMI or tessellated text.
struct TarvexAuthoredVisuEdge {
    std::optional<VizPort::WString> mechanicalId;
    std::vector<float> points;
    std::optional<std::vector<int>> lineIndices;
    TarvexVisuLineType lineType = TarvexVisuLine_Polyline;
    std::optional<std::array<unsigned short, 3>> rgb;
    std::optional<unsigned short> alpha;
};

/// Loose points of a point set.
struct TarvexAuthoredVisuPoints {
    std::vector<float> points;
    std::optional<std::vector<int>> pointIndices;
    std::optional<std::array<unsigned short, 3>> rgb;
    std::optional<unsigned short> alpha;
};

/// Triangles of a face, by offsets into the face's vertex and normal arrays.
struct TarvexAuthoredVisuPolygon {
    std::optional<std::vector<int>> indices;
    TarvexVisuPolygonType type = TarvexVisuPolygon_Triangles;
};

/// A face: vertices, a normal per vertex, and the polygons that index both.
struct TarvexAuthoredVisuFace {
    std::optional<VizPort::WString> id;
    std::optional<VizPort::WString> mechanicalId;
    std::vector<float> vertices;
    std::vector<float> normals;
    std::vector<TarvexAuthoredVisuPolygon> polygons;
    std::optional<std::array<unsigned short, 3>> rgb;
    std::optional<unsigned short> alpha;
};

struct TarvexAuthoredVisuMesh {
    std::optional<VizPort::WString> id;
    std::optional<VizPort::WString> mechanicalId;
    TarvexVisuGeometryType geometryType = TarvexVisuGeometry_Standard;
    std::vector<TarvexAuthoredVisuFace> faces;
    std::vector<TarvexAuthoredVisuEdge> edges;
};

struct TarvexAuthoredVisuWire {
    std::optional<VizPort::WString> id;
    TarvexVisuGeometryType geometryType = TarvexVisuGeometry_Standard;
    std::vector<TarvexAuthoredVisuEdge> edges;
};

struct TarvexAuthoredVisuPointSet {
    TarvexVisuGeometryType geometryType = TarvexVisuGeometry_Standard;
    std::vector<TarvexAuthoredVisuPoints> points;
};

#pragma once

#include <VizBridge/contracts/kolba/OwnedPointers.h>
#include <VizBridge/contracts/kolba/VizElement.h>
#include <VizBridge/contracts/kolba/VizPolygon.h>
#include <VizBridge/contracts/platform/WString.h>

#include <string>
#include <vector>

namespace KolbaVizCore {

/// One face of a mesh, or a filled shape of a tessellated text: coordinate and normal arrays
/// (three floats a point) and the polygons that index them. Owns its polygons.
class VizFace : public VizElement {
public:
    VizFace() = default;
    VizFace(VizFace const&) = delete;
    VizFace& operator=(VizFace const&) = delete;

    static std::string TypeID() { return "VizFace"; }
    std::string const GetElementType() const override { return TypeID(); }

    void SetMechanicalID(VizPort::WString const& id) { m_mechanicalId = id; }
    VizPort::WString GetMechanicalID() const { return m_mechanicalId; }

    /// Keeps a copy of `count` floats; a null array leaves none.
    void SetVertices(unsigned int count, float const* vertices);
    void SetNormals(unsigned int count, float const* normals);
    std::vector<float> const& GetVertices() const { return m_vertices; }
    std::vector<float> const& GetNormals() const { return m_normals; }

    /// How many polygons will be added.
    void SetPolygonSizeHint(unsigned int count) { m_polygons.Reserve(count); }
    /// Takes over `polygon`; null is ignored.
    void AddPolygon(VizPolygon* polygon) { m_polygons.Add(polygon); }
    std::vector<VizPolygon*> const& GetPolygons() const { return m_polygons.Get(); }

private:
    VizPort::WString m_mechanicalId;
    std::vector<float> m_vertices;
    std::vector<float> m_normals;
    OwnedPointers<VizPolygon> m_polygons;
};

} // namespace KolbaVizCore

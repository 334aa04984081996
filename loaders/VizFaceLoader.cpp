#include "loaders/VizFaceLoader.h"

#include "contracts/kolba/RGBAColor.h"
#include "contracts/kolba/VizFace.h"
#include "contracts/kolba/VizPolygon.h"
#include "contracts/tarvex/TarvexVisuPolygonIter.h"
#include "contracts/tarvex/TarvexWString.h"
#include "loaders/LoadAs.h"
#include "loaders/VisuColor.h"
#include "loaders/VizPolygonLoader.h"

namespace VizBridgeTarvex {

using KolbaVizCore::VizFace;
using KolbaVizCore::VizPolygon;

namespace {

unsigned int countOf(int const count) {
    return count > 0 ? static_cast<unsigned int>(count) : 0u;
}

} // namespace

VizFaceLoader::VizFaceLoader(TarvexVisuFace const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : m_inheritAttributes(inheritAttributes), m_attributes(attributes), m_source(&source) {}

KolbaVizCore::VizElement* VizFaceLoader::loadOne() {
    auto* const face = dynamic_cast<VizFace*>(makeOne());
    if (face == nullptr)
        return nullptr;

    TarvexWString id;
    if (m_source->GetID(id))
        face->SetVisualID(id.ToWString());
    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        face->SetMechanicalID(mechanicalId.ToWString());

    // A face always inherits: a mesh's faces show the colour of the nodes above them.
    KolbaVizCore::RGBAColor color;
    if (resolveVisuColor(*m_source, m_attributes, color, true))
        face->SetColor(color);

    // The arrays belong to the source; the face keeps copies.
    float const* vertices = nullptr;
    int const vertexFloats = m_source->GetVertices(vertices);
    face->SetVertices(countOf(vertexFloats), vertices);
    float const* normals = nullptr;
    int const normalFloats = m_source->GetNormals(normals);
    face->SetNormals(countOf(normalFloats), normals);

    TarvexVisuPolygonIter polygons = m_source->GetPolygonIterator();
    face->SetPolygonSizeHint(countOf(polygons.GetCount()));
    while (polygons.Next()) {
        TarvexVisuPolygon const source = polygons.Current();
        VizPolygonLoader loader(source, m_attributes, m_inheritAttributes);
        face->AddPolygon(loadAs<VizPolygon>(loader).release());
    }
    return face;
}

} // namespace VizBridgeTarvex

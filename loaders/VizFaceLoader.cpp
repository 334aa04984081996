#include <VizBridge/loaders/VizFaceLoader.h>

#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizPolygon.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPolygonIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>
#include <VizBridge/loaders/HandOver.h>
#include <VizBridge/loaders/LoadAs.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/loaders/VisuColor.h>
#include <VizBridge/loaders/VizPolygonLoader.h>

namespace VizBridgeTarvex {

using KolbaVizCore::VizFace;
using KolbaVizCore::VizPolygon;

VizFaceLoader::VizFaceLoader(TarvexVisuFace const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : VizSourceLoader(source, attributes, inheritAttributes) {}

KolbaVizCore::VizElement* VizFaceLoader::loadOne() {
    auto* const face = dynamic_cast<VizFace*>(makeOne());
    if (face == nullptr)
        return nullptr;

    TarvexWString id;
    if (m_source->GetID(id))
        face->SetVisualID(textOrEmpty(id));
    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        face->SetMechanicalID(textOrEmpty(mechanicalId));

    // A face always inherits: a mesh's faces show the colour of the nodes above them.
    KolbaVizCore::RGBAColor color;
    if (resolveVisuColor(*m_source, m_attributes, color, true))
        face->SetColor(color);

    // The arrays belong to the source; the face keeps copies.
    float const* vertices = nullptr;
    int const vertexFloats = m_source->GetVertices(vertices);
    face->SetVertices(countHint(vertexFloats), vertices);
    float const* normals = nullptr;
    int const normalFloats = m_source->GetNormals(normals);
    face->SetNormals(countHint(normalFloats), normals);

    TarvexVisuPolygonIter polygons = m_source->GetPolygonIterator();
    face->SetPolygonSizeHint(countHint(polygons.GetCount()));
    while (polygons.Next()) {
        TarvexVisuPolygon const source = polygons.Current();
        VizPolygonLoader loader(source, m_attributes, m_inheritAttributes);
        handOver(loadAs<VizPolygon>(loader),
                 [face](VizPolygon* const polygon) { face->AddPolygon(polygon); });
    }
    return face;
}

} // namespace VizBridgeTarvex

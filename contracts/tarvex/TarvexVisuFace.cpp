#include <VizBridge/contracts/tarvex/TarvexVisuFace.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPolygonIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using Face = TarvexAuthoredVisuFace;

bool TarvexVisuFace::GetID(TarvexWString& id) const {
    Face const* const face = m_context.Read(m_record, "TarvexVisuFace::GetID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(face, &Face::id), id);
}

bool TarvexVisuFace::GetMechanicalID(TarvexWString& id) const {
    Face const* const face = m_context.Read(m_record, "TarvexVisuFace::GetMechanicalID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(face, &Face::mechanicalId), id);
}

bool TarvexVisuFace::GetRGBColor(unsigned short& red, unsigned short& green,
                                 unsigned short& blue) const {
    Face const* const face = m_context.Read(m_record, "TarvexVisuFace::GetRGBColor");
    return TarvexVisuValues::Rgb(TarvexVisuValues::Member(face, &Face::rgb), red, green, blue);
}

bool TarvexVisuFace::GetAlphaColor(unsigned short& alpha) const {
    Face const* const face = m_context.Read(m_record, "TarvexVisuFace::GetAlphaColor");
    return TarvexVisuValues::Alpha(TarvexVisuValues::Member(face, &Face::alpha), alpha);
}

int TarvexVisuFace::GetVertices(float const*& vertices) const {
    Face const* const face = m_context.Read(m_record, "TarvexVisuFace::GetVertices");
    return TarvexVisuValues::Floats(TarvexVisuValues::Member(face, &Face::vertices), vertices);
}

int TarvexVisuFace::GetNormals(float const*& normals) const {
    Face const* const face = m_context.Read(m_record, "TarvexVisuFace::GetNormals");
    return TarvexVisuValues::Floats(TarvexVisuValues::Member(face, &Face::normals), normals);
}

TarvexVisuPolygonIter TarvexVisuFace::GetPolygonIterator() const {
    Face const* const face = m_context.Read(m_record, "TarvexVisuFace::GetPolygonIterator");
    if (face == nullptr) {
        return TarvexVisuPolygonIter();
    }
    return TarvexVisuPolygonIter(m_context, {m_record, &face->polygons});
}

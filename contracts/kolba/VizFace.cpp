#include <VizBridge/contracts/kolba/VizFace.h>

namespace KolbaVizCore {

namespace {

void copyInto(std::vector<float>& target, unsigned int count, float const* values) {
    if (values == nullptr)
        target.clear();
    else
        target.assign(values, values + count);
}

} // namespace

void VizFace::SetVertices(unsigned int count, float const* vertices) {
    copyInto(m_vertices, count, vertices);
}

void VizFace::SetNormals(unsigned int count, float const* normals) {
    copyInto(m_normals, count, normals);
}

} // namespace KolbaVizCore

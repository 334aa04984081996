#include <VizBridge/contracts/kolba/VizPolygon.h>

namespace KolbaVizCore {

void VizPolygon::SetIndices(unsigned int count, int const* indices) {
    if (indices == nullptr)
        m_indices.clear();
    else
        m_indices.assign(indices, indices + count);
}

} // namespace KolbaVizCore

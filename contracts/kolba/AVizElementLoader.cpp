#include <VizBridge/contracts/kolba/AVizElementLoader.h>

#include <cstddef>

namespace KolbaVizCore {

VizElement* AVizElementLoader::Load() {
    // Elements kept before this run (a nested Load, or makeOne outside a run) are not this
    // run's to free.
    std::size_t const firstOfRun = m_kept.size();
    VizElement* result = nullptr;
    try {
        result = loadOne();
    } catch (...) {
        m_kept.resize(firstOfRun);
        throw;
    }
    if (result != nullptr) {
        // Handed out: wherever it is kept, it is no longer the loader's.
        for (std::unique_ptr<VizElement>& kept : m_kept)
            if (kept.get() == result)
                static_cast<void>(kept.release());
    }
    m_kept.resize(firstOfRun);
    return result;
}

} // namespace KolbaVizCore

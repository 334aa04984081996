#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizElement.h>

#include <memory>

namespace VizBridgeTarvex {

/// Runs `loader` once and gives its element as the class the caller expects, or null. The
/// loader hands over what it loaded, so an element of another class is freed here.
template <class Element> std::unique_ptr<Element> loadAs(KolbaVizCore::AVizElementLoader& loader) {
    std::unique_ptr<KolbaVizCore::VizElement> loaded(loader.Load());
    if (auto* const element = dynamic_cast<Element*>(loaded.get())) {
        static_cast<void>(loaded.release());
        return std::unique_ptr<Element>(element);
    }
    return nullptr;
}

} // namespace VizBridgeTarvex

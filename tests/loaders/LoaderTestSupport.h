#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>

#include <array>
#include <cstdint>
#include <memory>
#include <optional>
#include <utility>
#include <vector>

namespace LoaderTest {

using Rgb = std::optional<std::array<unsigned short, 3>>;
using Alpha = std::optional<unsigned short>;

/// A value object of the visualisation data that reads `record`, outside any model.
template <class Value, class Record> Value Make(Record record) {
    return Value(TarvexVisuContext(), std::make_shared<Record const>(std::move(record)));
}

inline TarvexAuthoredVisuAttributes Attributes(Rgb rgb, Alpha alpha) {
    TarvexAuthoredVisuAttributes attributes;
    attributes.rgb = rgb;
    attributes.alpha = alpha;
    return attributes;
}

/// An attribute stack, oldest entry first.
inline std::vector<TarvexVisuAttributes>
Stack(std::vector<TarvexAuthoredVisuAttributes> const& entries) {
    std::vector<TarvexVisuAttributes> stack;
    for (TarvexAuthoredVisuAttributes const& entry : entries)
        stack.push_back(Make<TarvexVisuAttributes>(entry));
    return stack;
}

/// The colour an element gets when `rgb` and `alpha` are what was found: a default colour with
/// what was found written over it.
inline KolbaVizCore::RGBAColor Found(Rgb rgb, Alpha alpha) {
    KolbaVizCore::RGBAColor color;
    if (rgb)
        color = KolbaVizCore::RGBAColor(static_cast<std::uint8_t>((*rgb)[0]),
                                        static_cast<std::uint8_t>((*rgb)[1]),
                                        static_cast<std::uint8_t>((*rgb)[2]), color.alpha);
    if (alpha)
        color.alpha = static_cast<std::uint8_t>(*alpha);
    return color;
}

/// Runs `loader` and takes over its element as `Element`; null if there was none or it was of
/// another class (the test then fails on the null).
template <class Element> std::unique_ptr<Element> LoadAs(KolbaVizCore::AVizElementLoader& loader) {
    std::unique_ptr<KolbaVizCore::VizElement> loaded(loader.Load());
    auto* const element = dynamic_cast<Element*>(loaded.get());
    if (element == nullptr)
        return nullptr;
    static_cast<void>(loaded.release());
    return std::unique_ptr<Element>(element);
}

} // namespace LoaderTest

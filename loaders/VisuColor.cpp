#include <VizBridge/loaders/VisuColor.h>

#include <VizBridge/loaders/TarvexValues.h>

namespace VizBridgeTarvex {

namespace {

using KolbaVizCore::RGBAColor;

/// Asks `holder` for its colour; on success the colour's red, green and blue become it.
template <class Holder> bool takeRgb(Holder const& holder, RGBAColor& working) {
    unsigned short red = 0;
    unsigned short green = 0;
    unsigned short blue = 0;
    if (!holder.GetRGBColor(red, green, blue))
        return false;
    working.red = colorByte(red);
    working.green = colorByte(green);
    working.blue = colorByte(blue);
    return true;
}

/// Asks `holder` for its alpha; on success the colour's alpha becomes it.
template <class Holder> bool takeAlpha(Holder const& holder, RGBAColor& working) {
    unsigned short alpha = 0;
    if (!holder.GetAlphaColor(alpha))
        return false;
    working.alpha = colorByte(alpha);
    return true;
}

/// The newest entry of the stack for which `take` succeeds, if any.
template <class Take>
bool takeFromStack(std::vector<TarvexVisuAttributes> const& attributes, Take take) {
    for (auto entry = attributes.rbegin(); entry != attributes.rend(); ++entry) {
        TarvexVisuAttributes const copy = *entry;
        if (take(copy))
            return true;
    }
    return false;
}

template <class Source>
bool resolve(Source const& source, std::vector<TarvexVisuAttributes> const* attributes,
             RGBAColor& color, bool const inherit) {
    RGBAColor working;
    bool const searchStack = inherit && attributes != nullptr;

    // Colour and alpha are separate searches: a source may carry its own alpha and still take
    // its colour from an entry far up the stack, or the other way round.
    bool foundRgb = takeRgb(source, working);
    if (!foundRgb && searchStack)
        foundRgb = takeFromStack(*attributes, [&working](TarvexVisuAttributes const& entry) {
            return takeRgb(entry, working);
        });

    bool foundAlpha = takeAlpha(source, working);
    if (!foundAlpha && searchStack)
        foundAlpha = takeFromStack(*attributes, [&working](TarvexVisuAttributes const& entry) {
            return takeAlpha(entry, working);
        });

    if (!foundRgb && !foundAlpha)
        return false;
    color = working;
    return true;
}

} // namespace

bool resolveVisuColor(TarvexVisuEdge const& source, std::vector<TarvexVisuAttributes>* attributes,
                      RGBAColor& color, bool inherit) {
    return resolve(source, attributes, color, inherit);
}

bool resolveVisuColor(TarvexVisuFace const& source, std::vector<TarvexVisuAttributes>* attributes,
                      RGBAColor& color, bool inherit) {
    return resolve(source, attributes, color, inherit);
}

bool resolveVisuColor(TarvexVisuPoints const& source, std::vector<TarvexVisuAttributes>* attributes,
                      RGBAColor& color, bool inherit) {
    return resolve(source, attributes, color, inherit);
}

bool resolveVisuColor(TarvexVisuText const& source, std::vector<TarvexVisuAttributes>* attributes,
                      RGBAColor& color, bool inherit) {
    return resolve(source, attributes, color, inherit);
}

} // namespace VizBridgeTarvex

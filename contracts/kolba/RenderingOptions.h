#pragma once

#include <VizBridge/contracts/kolba/RGBAColor.h>

namespace KolbaVizCore {

/// The defaults a renderer draws with when an element has no colour of its own: opaque
/// light grey for faces, opaque black for edges, points and texts. A plain value.
class RenderingOptions {
public:
    RGBAColor GetDefaultFaceColor() const { return m_defaultFaceColor; }
    RGBAColor GetDefaultEdgeColor() const { return m_defaultEdgeColor; }
    void SetDefaultFaceColor(RGBAColor const& color) { m_defaultFaceColor = color; }
    void SetDefaultEdgeColor(RGBAColor const& color) { m_defaultEdgeColor = color; }

private:
    RGBAColor m_defaultFaceColor{192, 192, 192, 255};
    RGBAColor m_defaultEdgeColor{0, 0, 0, 255};
};

} // namespace KolbaVizCore

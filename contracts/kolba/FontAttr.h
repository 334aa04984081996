#pragma once

namespace KolbaVizCore {

/// How a text is set: its height in the text's own length unit, the factor between
/// characters and the factor of the character width. Each is 1 when nothing says otherwise.
struct FontAttr {
    float size = 1.0f;
    float spacing = 1.0f;
    float widthScaling = 1.0f;

    bool operator==(FontAttr const& o) const {
        return size == o.size && spacing == o.spacing && widthScaling == o.widthScaling;
    }
    bool operator!=(FontAttr const& o) const { return !(*this == o); }
};

} // namespace KolbaVizCore

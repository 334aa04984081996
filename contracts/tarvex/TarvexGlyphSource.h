#pragma once

#include <VizBridge/contracts/tarvex/TarvexPolygonTriangulator.h>

#include <map>
#include <memory>
#include <string>
#include <vector>

/// One scalable font file, read through FreeType: its metrics and the outlines of its glyphs,
/// in font units, with curves flattened to polylines, and filled. Owns the FreeType library and
/// face it opened. Not thread-safe; TarvexFontCache serialises its use. Internal to the library.
class TarvexGlyphSource {
public:
    struct Glyph {
        /// Closed contours that do not repeat their first point. TrueType outlines run
        /// clockwise around filled parts and counter-clockwise around holes.
        std::vector<TarvexPolygonTriangulator::Contour> contours;
        double advance = 0; ///< how far the next glyph starts along the baseline
        /// The glyph filled. Kept with the outline because a text repeats its letters, and
        /// scaling and moving the points keeps the triangles valid.
        TarvexPolygonTriangulator::Triangulation filled;
    };

    /// Throws std::runtime_error when the file cannot be read as a scalable font.
    explicit TarvexGlyphSource(std::string const& path);
    ~TarvexGlyphSource();
    TarvexGlyphSource(TarvexGlyphSource const&) = delete;
    TarvexGlyphSource& operator=(TarvexGlyphSource const&) = delete;

    double GetUnitsPerEm() const { return m_unitsPerEm; }
    /// The height of a capital letter above the baseline.
    double GetCapHeight() const { return m_capHeight; }
    /// The distance from one baseline to the next.
    double GetLineSpacing() const { return m_lineSpacing; }

    /// The glyph of `codePoint`; the font's shape for a missing glyph when it has none.
    /// Loaded on first use and kept: the reference stays valid as long as this object.
    Glyph const& GetGlyph(char32_t codePoint);

private:
    struct FreeType;

    Glyph load(char32_t codePoint) const;

    std::unique_ptr<FreeType> m_freeType;
    double m_unitsPerEm = 0;
    double m_capHeight = 0;
    double m_lineSpacing = 0;
    std::map<char32_t, Glyph> m_glyphs;
};

#include <VizBridge/contracts/tarvex/TarvexGlyphSource.h>

#include <ft2build.h>
#include FT_FREETYPE_H
#include FT_OUTLINE_H
#include FT_TRUETYPE_TABLES_H

#include <algorithm>
#include <cmath>
#include <stdexcept>

struct TarvexGlyphSource::FreeType {
    FT_Library library = nullptr;
    FT_Face face = nullptr;

    FreeType() = default;
    FreeType(FreeType const&) = delete;
    FreeType& operator=(FreeType const&) = delete;
    ~FreeType() {
        if (face != nullptr) {
            FT_Done_Face(face);
        }
        if (library != nullptr) {
            FT_Done_FreeType(library);
        }
    }
};

namespace {

using Point = TarvexPolygonTriangulator::Point;
using Contour = TarvexPolygonTriangulator::Contour;

/// Collects the contours of one outline, flattening its curves so that no polyline strays
/// further than `tolerance` font units from the curve.
struct Flattener {
    std::vector<Contour> contours;
    Point current{0, 0};
    double tolerance = 1;

    static Point point(FT_Vector const* vector) {
        return {static_cast<double>(vector->x), static_cast<double>(vector->y)};
    }

    /// Segments for a curve whose control polygon bends by `deviation`: the chord error of a
    /// Bezier curve falls with the square of the number of segments.
    int segments(double deviation) const {
        double const wanted = std::ceil(std::sqrt(deviation / tolerance));
        return static_cast<int>(std::clamp(wanted, 1.0, 64.0));
    }

    void add(Point const& p) {
        contours.back().push_back(p);
        current = p;
    }

    static int moveTo(FT_Vector const* to, void* user) {
        auto& self = *static_cast<Flattener*>(user);
        self.contours.emplace_back();
        self.add(point(to));
        return 0;
    }

    static int lineTo(FT_Vector const* to, void* user) {
        static_cast<Flattener*>(user)->add(point(to));
        return 0;
    }

    static int conicTo(FT_Vector const* control, FT_Vector const* to, void* user) {
        auto& self = *static_cast<Flattener*>(user);
        Point const p0 = self.current;
        Point const p1 = point(control);
        Point const p2 = point(to);
        double const deviation =
            std::hypot(p0[0] - 2 * p1[0] + p2[0], p0[1] - 2 * p1[1] + p2[1]) / 4;
        int const n = self.segments(deviation);
        for (int step = 1; step <= n; ++step) {
            double const t = double(step) / n;
            double const u = 1 - t;
            self.add({u * u * p0[0] + 2 * u * t * p1[0] + t * t * p2[0],
                      u * u * p0[1] + 2 * u * t * p1[1] + t * t * p2[1]});
        }
        return 0;
    }

    static int cubicTo(FT_Vector const* control1, FT_Vector const* control2, FT_Vector const* to,
                       void* user) {
        auto& self = *static_cast<Flattener*>(user);
        Point const p0 = self.current;
        Point const p1 = point(control1);
        Point const p2 = point(control2);
        Point const p3 = point(to);
        double const deviation =
            std::max(std::hypot(p0[0] - 2 * p1[0] + p2[0], p0[1] - 2 * p1[1] + p2[1]),
                     std::hypot(p1[0] - 2 * p2[0] + p3[0], p1[1] - 2 * p2[1] + p3[1])) *
            3 / 4;
        int const n = self.segments(deviation);
        for (int step = 1; step <= n; ++step) {
            double const t = double(step) / n;
            double const u = 1 - t;
            double const a = u * u * u;
            double const b = 3 * u * u * t;
            double const c = 3 * u * t * t;
            double const d = t * t * t;
            self.add({a * p0[0] + b * p1[0] + c * p2[0] + d * p3[0],
                      a * p0[1] + b * p1[1] + c * p2[1] + d * p3[1]});
        }
        return 0;
    }
};

constexpr FT_Int32 kLoadFlags = FT_LOAD_NO_SCALE | FT_LOAD_NO_HINTING | FT_LOAD_NO_BITMAP;

} // namespace

TarvexGlyphSource::TarvexGlyphSource(std::string const& path)
    : m_freeType(std::make_unique<FreeType>()) {
    if (FT_Init_FreeType(&m_freeType->library) != 0) {
        throw std::runtime_error("TarvexGlyphSource: FreeType could not be started");
    }
    if (FT_New_Face(m_freeType->library, path.c_str(), 0, &m_freeType->face) != 0) {
        throw std::runtime_error("TarvexGlyphSource: cannot read the font file " + path);
    }
    FT_Face const face = m_freeType->face;
    if (!FT_IS_SCALABLE(face) || face->units_per_EM == 0) {
        throw std::runtime_error("TarvexGlyphSource: the font file " + path + " has no outlines");
    }
    m_unitsPerEm = face->units_per_EM;
    m_lineSpacing = face->height > 0 ? face->height : 1.2 * m_unitsPerEm;

    // The font's own cap height if it states one, else the height of its "H".
    auto const* const os2 = static_cast<TT_OS2 const*>(FT_Get_Sfnt_Table(face, FT_SFNT_OS2));
    if (os2 != nullptr && os2->version >= 2 && os2->sCapHeight > 0) {
        m_capHeight = os2->sCapHeight;
    } else if (FT_Load_Char(face, 'H', kLoadFlags) == 0 &&
               face->glyph->format == FT_GLYPH_FORMAT_OUTLINE) {
        FT_BBox box;
        FT_Outline_Get_CBox(&face->glyph->outline, &box);
        m_capHeight = static_cast<double>(box.yMax);
    }
    if (m_capHeight <= 0) {
        m_capHeight = 0.7 * m_unitsPerEm;
    }
}

TarvexGlyphSource::~TarvexGlyphSource() = default;

TarvexGlyphSource::Glyph const& TarvexGlyphSource::GetGlyph(char32_t codePoint) {
    auto found = m_glyphs.find(codePoint);
    if (found == m_glyphs.end()) {
        found = m_glyphs.emplace(codePoint, load(codePoint)).first;
    }
    return found->second;
}

TarvexGlyphSource::Glyph TarvexGlyphSource::load(char32_t codePoint) const {
    FT_Face const face = m_freeType->face;
    // Glyph index 0 is the font's shape for characters it lacks.
    FT_UInt const index = FT_Get_Char_Index(face, static_cast<FT_ULong>(codePoint));
    if (FT_Load_Glyph(face, index, kLoadFlags) != 0) {
        throw std::runtime_error("TarvexGlyphSource: cannot load a glyph");
    }
    Glyph glyph;
    glyph.advance = static_cast<double>(face->glyph->metrics.horiAdvance);
    if (face->glyph->format != FT_GLYPH_FORMAT_OUTLINE) {
        return glyph;
    }

    FT_Outline_Funcs funcs{};
    funcs.move_to = &Flattener::moveTo;
    funcs.line_to = &Flattener::lineTo;
    funcs.conic_to = &Flattener::conicTo;
    funcs.cubic_to = &Flattener::cubicTo;
    Flattener flattener;
    flattener.tolerance = m_unitsPerEm / 2000;
    if (FT_Outline_Decompose(&face->glyph->outline, &funcs, &flattener) != 0) {
        throw std::runtime_error("TarvexGlyphSource: cannot read a glyph outline");
    }
    for (Contour& contour : flattener.contours) {
        // The decomposition closes each contour by returning to its start.
        if (contour.size() > 1 && contour.front() == contour.back()) {
            contour.pop_back();
        }
        if (contour.size() >= 3) {
            glyph.contours.push_back(std::move(contour));
        }
    }
    glyph.filled = TarvexPolygonTriangulator::Triangulate(glyph.contours);
    return glyph;
}

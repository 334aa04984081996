#include <VizBridge/contracts/tarvex/TarvexVisu2DTextBuilder.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexFontCache.h>
#include <VizBridge/contracts/tarvex/TarvexGlyphSource.h>
#include <VizBridge/contracts/tarvex/TarvexModelData.h>
#include <VizBridge/contracts/tarvex/TarvexPolygonTriangulator.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFont.h>
#include <VizBridge/contracts/tarvex/TarvexVisuText.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <functional>
#include <optional>
#include <stdexcept>
#include <string>

namespace {

using Vector = std::array<double, 3>;
using Point = TarvexPolygonTriangulator::Point;
using Contour = TarvexPolygonTriangulator::Contour;

[[noreturn]] void reject(std::string const& why) {
    throw std::invalid_argument("TarvexVisu2DTextBuilder::Build2DText: " + why);
}

double dot(Vector const& a, Vector const& b) {
    return a[0] * b[0] + a[1] * b[1] + a[2] * b[2];
}

Vector crossProduct(Vector const& a, Vector const& b) {
    return {a[1] * b[2] - a[2] * b[1], a[2] * b[0] - a[0] * b[2], a[0] * b[1] - a[1] * b[0]};
}

Vector widened(std::array<float, 3> const& v, char const* what) {
    Vector const wide{v[0], v[1], v[2]};
    for (double const component : wide) {
        if (!std::isfinite(component)) {
            reject(std::string("the ") + what + " is not finite");
        }
    }
    return wide;
}

/// A font value, or 1 when it is absent; it must be a positive finite number.
double factor(std::optional<float> const* value, char const* what) {
    double const factor = value != nullptr && *value ? **value : 1.0;
    if (!std::isfinite(factor) || factor <= 0) {
        reject(std::string("the ") + what + " is not a positive number");
    }
    return factor;
}

/// The plane the text is laid out in: where it starts, the unit direction along it and the
/// unit direction up its glyphs, and the unit normal.
struct Frame {
    Vector origin;
    Vector along;
    Vector up;
    Vector normal;

    explicit Frame(TarvexAuthoredVisuText const& text) {
        origin = widened(text.anchor, "anchor");
        Vector const direction = widened(text.direction, "direction");
        Vector const n = widened(text.normal, "normal");
        double const normalLength = std::sqrt(dot(n, n));
        if (!(normalLength > 0) || !std::isfinite(normalLength)) {
            reject("the normal has no length");
        }
        normal = {n[0] / normalLength, n[1] / normalLength, n[2] / normalLength};
        // The direction's part in the plane; what runs along the normal cannot orient glyphs.
        double const along_normal = dot(direction, normal);
        Vector const inPlane{direction[0] - along_normal * normal[0],
                             direction[1] - along_normal * normal[1],
                             direction[2] - along_normal * normal[2]};
        double const length = std::sqrt(dot(inPlane, inPlane));
        double const directionLength = std::sqrt(dot(direction, direction));
        if (!(length > 1e-9 * directionLength) || !std::isfinite(length)) {
            reject("the direction is zero or runs along the normal");
        }
        along = {inPlane[0] / length, inPlane[1] / length, inPlane[2] / length};
        up = crossProduct(normal, along);
    }

    void place(Point const& local, std::vector<float>& coordinates) const {
        for (std::size_t axis = 0; axis < 3; ++axis) {
            coordinates.push_back(
                static_cast<float>(origin[axis] + local[0] * along[axis] + local[1] * up[axis]));
        }
    }
};

/// The code points of UTF-16 text; an unpaired surrogate stands for U+FFFD.
std::vector<char32_t> codePoints(VizPort::WString const& text) {
    std::vector<char32_t> points;
    for (std::size_t i = 0; i < text.size(); ++i) {
        char32_t const unit = text[i];
        if (unit >= 0xD800 && unit <= 0xDBFF && i + 1 < text.size() && text[i + 1] >= 0xDC00 &&
            text[i + 1] <= 0xDFFF) {
            points.push_back(0x10000 + ((unit - 0xD800) << 10) + (char32_t(text[i + 1]) - 0xDC00));
            ++i;
        } else if (unit >= 0xD800 && unit <= 0xDFFF) {
            points.push_back(0xFFFD);
        } else {
            points.push_back(unit);
        }
    }
    return points;
}

TarvexAuthoredVisuEdge stroke(Contour const& contour, Frame const& frame) {
    TarvexAuthoredVisuEdge edge;
    edge.lineType = TarvexVisuLine_ClosedPolyline;
    edge.lineIndices.emplace();
    for (Point const& point : contour) {
        edge.lineIndices->push_back(static_cast<int>(edge.points.size()));
        frame.place(point, edge.points);
    }
    return edge;
}

/// The filled glyph placed by `local`, which maps font units into the text's plane; none if
/// the glyph encloses nothing.
std::optional<TarvexAuthoredVisuFace> fill(TarvexPolygonTriangulator::Triangulation const& filled,
                                           std::function<Point(Point const&)> const& local,
                                           Frame const& frame) {
    if (filled.triangles.empty()) {
        return std::nullopt;
    }
    TarvexAuthoredVisuFace face;
    for (Point const& point : filled.points) {
        frame.place(local(point), face.vertices);
        for (double const component : frame.normal) {
            face.normals.push_back(static_cast<float>(component));
        }
    }
    TarvexAuthoredVisuPolygon& polygon = face.polygons.emplace_back();
    polygon.type = TarvexVisuPolygon_Triangles;
    polygon.indices.emplace();
    for (auto const& triangle : filled.triangles) {
        for (std::size_t const corner : triangle) {
            polygon.indices->push_back(static_cast<int>(3 * corner));
        }
    }
    return face;
}

/// Whether every offset of `indices` starts a whole point of `coordinates`.
bool pointsInto(std::optional<std::vector<int>> const& indices,
                std::vector<float> const& coordinates) {
    return !indices || std::all_of(indices->begin(), indices->end(), [&](int offset) {
        return offset >= 0 && std::size_t(offset) + 3 <= coordinates.size();
    });
}

void checkGlyphs(TarvexAuthoredVisuGlyphs const& glyphs) {
    for (TarvexAuthoredVisuEdge const& stroke : glyphs.strokes) {
        if (!pointsInto(stroke.lineIndices, stroke.points)) {
            reject("a stroke of the glyphs has indices outside its points");
        }
    }
    for (TarvexAuthoredVisuFace const& face : glyphs.faces) {
        for (TarvexAuthoredVisuPolygon const& polygon : face.polygons) {
            if (!pointsInto(polygon.indices, face.vertices) ||
                !pointsInto(polygon.indices, face.normals)) {
                reject("a face of the glyphs has indices outside its vertices");
            }
        }
    }
}

} // namespace

TarvexVisuBuild2DTextResult TarvexVisu2DTextBuilder::Build2DText(TarvexVisuText const& text,
                                                                 TarvexVisuFont const& font) const {
    text.m_context.Check("TarvexVisu2DTextBuilder::Build2DText");
    TarvexAuthoredVisuText const* const record = text.m_record.get();
    if (record != nullptr && record->glyphs) {
        // Shared with the import's data, which the result's pieces point into anyway.
        TarvexAuthoredVisuGlyphs const& glyphs = *record->glyphs;
        checkGlyphs(glyphs);
        return TarvexVisuBuild2DTextResult(
            text.m_context,
            std::shared_ptr<std::vector<TarvexAuthoredVisuEdge> const>(text.m_record,
                                                                       &glyphs.strokes),
            std::shared_ptr<std::vector<TarvexAuthoredVisuFace> const>(text.m_record,
                                                                       &glyphs.faces));
    }
    if (record == nullptr || !record->text || record->text->empty()) {
        reject("there is no text");
    }
    // The fonts are the model's; a text made by hand outside any import has none to use.
    if (!text.m_context.Model()) {
        reject("the text belongs to no model");
    }
    TarvexModelData const& model = *text.m_context.Model();

    TarvexAuthoredVisuFont const* const fontRecord = font.m_record.get();
    double const height =
        factor(fontRecord == nullptr ? nullptr : &fontRecord->textHeight, "text height");
    double const width = factor(fontRecord == nullptr ? nullptr : &fontRecord->widthScalingFactor,
                                "width scaling factor");
    double const spacing =
        factor(fontRecord == nullptr ? nullptr : &fontRecord->spacingFactor, "spacing factor");
    Frame const frame(*record);
    VizPort::WString const fontName =
        fontRecord != nullptr && fontRecord->name ? *fontRecord->name : VizPort::WString();

    auto strokes = std::make_shared<std::vector<TarvexAuthoredVisuEdge>>();
    auto faces = std::make_shared<std::vector<TarvexAuthoredVisuFace>>();
    model.fonts.Use(model.fonts.PathFor(fontName), [&](TarvexGlyphSource& source) {
        double const scale = height / source.GetCapHeight();
        double pen = 0; // font units along the line
        double baseline = 0;
        for (char32_t const codePoint : codePoints(*record->text)) {
            if (codePoint == U'\n') {
                pen = 0;
                baseline -= source.GetLineSpacing() * scale;
                continue;
            }
            if (codePoint == U'\r') {
                continue;
            }
            TarvexGlyphSource::Glyph const& glyph = source.GetGlyph(codePoint);
            // Both scale factors are positive, so the map keeps the triangles' turn.
            auto const local = [&](Point const& p) {
                return Point{(pen + p[0]) * scale * width, baseline + p[1] * scale};
            };
            for (Contour const& contour : glyph.contours) {
                Contour placed;
                placed.reserve(contour.size());
                for (Point const& point : contour) {
                    placed.push_back(local(point));
                }
                strokes->push_back(stroke(placed, frame));
            }
            if (std::optional<TarvexAuthoredVisuFace> face = fill(glyph.filled, local, frame)) {
                faces->push_back(std::move(*face));
            }
            pen += glyph.advance * spacing;
        }
    });
    return TarvexVisuBuild2DTextResult(text.m_context, std::move(strokes), std::move(faces));
}

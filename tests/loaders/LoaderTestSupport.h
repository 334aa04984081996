#pragma once

#include "support/DebugCapture.h"
#include "support/TarvexVisuTestModel.h"
#include <VizBridge/loaders/HandOver.h>
#include <VizBridge/loaders/LoadAs.h>
#include <VizBridge/loaders/VisuColor.h>
#include <VizBridge/loaders/VizCaptureLoader.h>
#include <VizBridge/loaders/VizEdgeLoader.h>
#include <VizBridge/loaders/VizMeshLoader.h>
#include <VizBridge/loaders/VizPMILoader.h>
#include <VizBridge/loaders/VizPointSetLoader.h>
#include <VizBridge/loaders/VizPointsLoader.h>
#include <VizBridge/loaders/VizTextLoader.h>
#include <VizBridge/loaders/VizViewLoader.h>
#include <VizBridge/loaders/VizWireLoader.h>

#include <sstream>

namespace LoaderTest {

using namespace KolbaVizCore;
using namespace VizBridgeTarvex;
using A = std::array<unsigned short, 3>;
using Indices = std::optional<std::vector<int>>;
using Stack = std::vector<TarvexVisuAttributes>;
using Entries = std::vector<TarvexAuthoredVisuAttributes>;
using Font = TarvexAuthoredVisuFont;

/// A value object of the visualisation data that reads `record`, outside any model.
template <class Value, class Record> Value Make(Record record) {
    return Value(TarvexVisuContext(), std::make_shared<Record const>(std::move(record)));
}

inline TarvexAuthoredVisuAttributes Entry(std::optional<A> rgb, std::optional<unsigned short> alpha,
                                          std::optional<Font> font = {}) {
    return {std::nullopt, rgb, alpha, std::move(font)};
}

/// An attribute stack, oldest entry first.
inline Stack StackOf(Entries const& entries) {
    Stack stack;
    for (TarvexAuthoredVisuAttributes const& entry : entries)
        stack.push_back(Make<TarvexVisuAttributes>(entry));
    return stack;
}

/// A polyline over the points (0 0 0) and (1 1 1).
inline TarvexAuthoredVisuEdge Line(Indices indices = std::vector<int>{0, 3},
                                   std::optional<VizPort::WString> id = {}) {
    return {id, {0, 0, 0, 1, 1, 1}, indices, TarvexVisuLine_Polyline, {}, {}};
}

/// A text at the origin, along x, facing z.
inline TarvexAuthoredVisuText TextRecord(std::optional<VizPort::WString> text) {
    return {std::move(text), {0, 0, 0}, {1, 0, 0}, {0, 0, 1}, {}, {}, {}};
}

inline std::string Show(VizElement const* element);

/// The items one after the other, `separator` between them: texts narrowed, elements shown.
template <class T> std::string Join(std::vector<T> const& items, char const* separator = " ") {
    std::ostringstream out;
    for (std::size_t i = 0; i < items.size(); ++i) {
        out << (i ? separator : "");
        if constexpr (std::is_pointer_v<T>)
            out << Show(items[i]);
        else if constexpr (std::is_same_v<T, VizPort::WString>)
            out << VizPort::Narrow(items[i]);
        else
            out << items[i];
    }
    return out.str();
}
inline std::string Triples(float const* a, float const* b, float const* c) {
    using F = std::vector<float>;
    return Join(F(a, a + 3)) + '|' + Join(F(b, b + 3)) + '|' + Join(F(c, c + 3));
}

/// An element as the expected texts spell it: its type, its colour when it has one, what it
/// holds (ids and names only when not empty; a PMI's group and type as name:id:entity type),
/// then its children, one a line.
inline std::string Show(VizElement const* element) {
    if (element == nullptr)
        return "null";
    char const* const lines[] = {"Undefined", "Polyline", "Closed", "Segments"};
    char const* const triangles[] = {"Undefined", "Triangles", "Strip", "Fan"};
    char const* const cameras[] = {"NoCamera", "Perspective", "Orthographic"};
    auto const text = [](char const* label, VizPort::WString const& value) {
        return value.empty() ? std::string() : label + VizPort::Narrow(value);
    };
    auto const children = [](auto const& items) {
        return items.empty() ? std::string() : "\n  " + Join(items, "\n  ");
    };
    RGBAColor const c = element->GetColor();
    std::ostringstream out;
    out << element->GetElementType() << (element->GetHidden() ? " hidden" : "")
        << text(" id=", element->GetVisualID());
    if (element->HasColor())
        out << " rgba(" << +c.red << ',' << +c.green << ',' << +c.blue << ',' << +c.alpha << ')';
    if (auto const* edge = dynamic_cast<VizEdge const*>(element))
        out << text(" m=", edge->GetMechanicalID()) << ' ' << lines[edge->GetLineType()] << '['
            << Join(edge->GetVertices()) << ']';
    if (auto const* points = dynamic_cast<VizPoints const*>(element))
        out << " [" << Join(points->GetVertices()) << ']';
    if (auto const* face = dynamic_cast<VizFace const*>(element)) {
        out << text(" m=", face->GetMechanicalID()) << " [" << Join(face->GetVertices()) << "] n["
            << Join(face->GetNormals()) << ']';
        for (VizPolygon const* p : face->GetPolygons())
            out << ' ' << triangles[p->GetPolygonType()] << '[' << Join(p->GetIndices()) << ']';
    }
    if (auto const* mesh = dynamic_cast<VizMesh const*>(element))
        out << text(" m=", mesh->GetMechanicalID()) << children(mesh->GetFaces())
            << children(mesh->GetEdges());
    if (auto const* wire = dynamic_cast<VizWire const*>(element))
        out << children(wire->GetEdges());
    if (auto const* set = dynamic_cast<VizPointSet const*>(element))
        out << children(set->GetPointSets());
    if (auto const* t = dynamic_cast<VizText const*>(element))
        out << " '" << VizPort::Narrow(t->GetText()) << "' " << VizPort::Narrow(t->GetFontName())
            << '(' << t->GetFontSize() << ' ' << t->GetSpacingFactor() << ' '
            << t->GetWidthScaling() << ") at "
            << Triples(t->GetAnchorPoint(), t->GetDirection(), t->GetNormal());
    if (auto const* pmi = dynamic_cast<VizPMI const*>(element)) {
        for (VizPMIType const& type : {pmi->GetGroupType(), pmi->GetType()})
            out << ' ' << type.GetName() << ':' << type.GetID() << ':' << type.GetEntityType();
        out << text(" name=", pmi->GetName()) << text(" m=", pmi->GetMechanicalID()) << " links "
            << Join(pmi->GetLinkedEntityIDs(), "|") << children(pmi->GetEdges())
            << children(pmi->GetFaces()) << children(pmi->GetTexts());
    }
    if (auto const* group = dynamic_cast<VizPMICollection const*>(element))
        out << (group->GetActive() ? " active" : "") << text(" name=", group->GetName())
            << text(" m=", group->GetMechanicalID())
            << (group->GetMembers().empty() ? "" : " members ") << Join(group->GetMembers(), "|");
    float a[3], b[3], d[3];
    if (auto const* view = dynamic_cast<VizView const*>(element); view && view->GetPlane(a, b, d))
        out << " plane " << Triples(a, b, d);
    if (auto const* capture = dynamic_cast<VizCapture const*>(element)) {
        out << ' ' << cameras[capture->GetCameraType()] << ' ' << capture->GetPerspectiveViewAngle()
            << ' ' << capture->GetOrthographicZoomFactor()
            << (capture->HasOrientation() ? " oriented" : "")
            << text(" hidden text ", capture->GetHiddenText());
        if (capture->GetClippingPlane(a, b, d))
            out << " clip " << Triples(a, b, d);
    }
    return out.str();
}

/// What a loader of the family loads from `source`, shown.
template <class Loader, class Source>
std::string Loaded(Source const& source, Stack* stack = nullptr, bool inherit = false) {
    Loader loader(source, stack, inherit);
    std::unique_ptr<VizElement> const element(loader.Load());
    return Show(element.get());
}

} // namespace LoaderTest

#include "ViewerQuestions.h"

#include <VizBridge/contracts/kolba/AView3DAdapter.h>
#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/render/TarvexRenderer.h>

#include <memory>
#include <string>

namespace VizBridgeExamples {

namespace {

using KolbaVizCore::EntityId;
using KolbaVizCore::RenderId;

/// "1/T/1000/10011": the product's tag, which the structure's address makes, as T.
std::string pathText(RenderId const& id, std::uint32_t product) {
    std::string text;
    for (std::uint32_t const tag : id.GetTags())
        text += (text.empty() ? "" : "/") + (tag == product ? "T" : std::to_string(tag));
    return text.empty() ? "(none)" : text;
}

std::string entityText(EntityId const& entity, std::uint32_t product) {
    auto const number = [product](std::uint32_t value) {
        return value == product ? std::string("T") : std::to_string(value);
    };
    return "(id " + number(entity.GetId()) + ", parent " + number(entity.GetParentId()) +
           ", type " + std::to_string(entity.GetType()) + ")";
}

/// The tool tip on one line: line feeds as " | ", blank lines left out.
std::string oneLine(VizPort::WString const& text) {
    std::string line;
    bool feed = false;
    for (char const c : VizPort::Narrow(text)) {
        if (c == '\n') {
            feed = !line.empty();
            continue;
        }
        if (feed)
            line += " | ";
        feed = false;
        line += c;
    }
    return line.empty() ? "(none)" : '"' + line + '"';
}

} // namespace

KolbaVizCore::Ray MakeRay(double const (&origin)[3], double const (&direction)[3]) {
    KolbaVizCore::Ray ray;
    for (int axis = 0; axis < 3; ++axis) {
        ray.origin[axis] = origin[axis];
        ray.direction[axis] = direction[axis];
    }
    return ray;
}

void PrintViewerQuestions(std::ostream& out, VizBridgeTarvex::TarvexRenderer& renderer,
                          KolbaVizCore::SceneBuilder const& scene,
                          KolbaVizCore::AView3DAdapter& view, char const* what,
                          KolbaVizCore::Ray const& ray) {
    RenderId picked;
    if (!view.PickRenderId(ray, picked)) {
        out << "  " << what << ": nothing picked\n";
        return;
    }
    PrintViewerQuestions(out, renderer, scene, what, picked);
}

void PrintViewerQuestions(std::ostream& out, VizBridgeTarvex::TarvexRenderer& renderer,
                          KolbaVizCore::SceneBuilder const& scene, char const* what,
                          RenderId const& picked) {
    RenderId const product = renderer.GetProductRenderId();
    std::uint32_t const tag = product.Length() > 1 ? product[1] : 0;
    out << "  " << what << ": render id " << pathText(picked, tag) << '\n';
    EntityId entity;
    if (renderer.Convert(picked, entity)) {
        RenderId back;
        bool const converted = renderer.Convert(entity, back);
        out << "    entity id " << entityText(entity, tag) << ", back to "
            << (converted ? pathText(back, tag) : "nothing")
            << (converted && scene.FindNode(back) == scene.FindNode(picked) ? " (the same node)"
                                                                            : "")
            << '\n';
    } else {
        out << "    no entity id\n";
    }
    RenderId* raw = nullptr;
    int count = 0;
    if (renderer.ConvertToHighlight(picked, raw, count)) {
        std::unique_ptr<RenderId[]> const paths(raw); // the caller's, released as an array
        for (int i = 0; i < count; ++i)
            out << "    highlight " << pathText(paths[i], tag) << '\n';
    }
    out << "    tool tip " << oneLine(renderer.GetToolTip(picked)) << '\n';
}

} // namespace VizBridgeExamples

#include <VizBridge/loaders/VizViewLoader.h>

#include <VizBridge/contracts/kolba/VizView.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIDIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>
#include <VizBridge/loaders/TarvexValues.h>

namespace VizBridgeTarvex {

using KolbaVizCore::VizView;

VizViewLoader::VizViewLoader(TarvexVisuView const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : VizSourceLoader(source, attributes, inheritAttributes) {}

KolbaVizCore::VizElement* VizViewLoader::loadOne() {
    auto* const view = dynamic_cast<VizView*>(makeOne());
    if (view == nullptr)
        return nullptr;

    // Absent values leave what the scene library gave the new view.
    bool hidden = false;
    if (m_source->GetHidden(hidden))
        view->SetHidden(hidden);
    view->SetName(textOrEmpty(m_source->GetDisplayName()));
    TarvexWString id;
    if (m_source->GetID(id))
        view->SetVisualID(textOrEmpty(id));
    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        view->SetMechanicalID(textOrEmpty(mechanicalId));

    float origin[3] = {};
    float first[3] = {};
    float second[3] = {};
    if (m_source->GetViewAxis(origin, first, second))
        view->SetPlane(origin, first, second);

    TarvexVisuIDIter annotations = m_source->GetAnnotationIDIterator();
    view->SetMemberCountHint(annotations.GetCount());
    while (annotations.Next())
        view->AddMember(textOrEmpty(annotations.Current()));
    return view;
}

} // namespace VizBridgeTarvex

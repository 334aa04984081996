#include "loaders/VizViewLoader.h"

#include "contracts/kolba/VizView.h"
#include "contracts/tarvex/TarvexVisuIDIter.h"
#include "contracts/tarvex/TarvexWString.h"

namespace VizBridgeTarvex {

using KolbaVizCore::VizView;

VizViewLoader::VizViewLoader(TarvexVisuView const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : m_inheritAttributes(inheritAttributes), m_attributes(attributes), m_source(&source) {}

KolbaVizCore::VizElement* VizViewLoader::loadOne() {
    auto* const view = dynamic_cast<VizView*>(makeOne());
    if (view == nullptr)
        return nullptr;

    // Absent values leave what the scene library gave the new view.
    bool hidden = false;
    if (m_source->GetHidden(hidden))
        view->SetHidden(hidden);
    view->SetName(m_source->GetDisplayName().ToWString());
    TarvexWString id;
    if (m_source->GetID(id))
        view->SetVisualID(id.ToWString());
    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        view->SetMechanicalID(mechanicalId.ToWString());

    float origin[3] = {};
    float first[3] = {};
    float second[3] = {};
    if (m_source->GetViewAxis(origin, first, second))
        view->SetPlane(origin, first, second);

    TarvexVisuIDIter annotations = m_source->GetAnnotationIDIterator();
    view->SetMemberCountHint(annotations.GetCount());
    while (annotations.Next())
        view->AddMember(annotations.Current().ToWString());
    return view;
}

} // namespace VizBridgeTarvex

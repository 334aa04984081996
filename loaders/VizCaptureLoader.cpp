#include "loaders/VizCaptureLoader.h"

#include "contracts/kolba/VizCapture.h"
#include "contracts/platform/WString.h"
#include "contracts/tarvex/TarvexEntity.h"
#include "contracts/tarvex/TarvexEntityIter.h"
#include "contracts/tarvex/TarvexInstanceEntity.h"
#include "contracts/tarvex/TarvexVisuCamera.h"
#include "contracts/tarvex/TarvexVisuEntity.h"
#include "contracts/tarvex/TarvexVisuIDIter.h"
#include "contracts/tarvex/TarvexWString.h"

#include <vector>

namespace VizBridgeTarvex {

using KolbaVizCore::VizCapture;

namespace {

VizCapture::CameraType toCameraType(TarvexVisuCamera::TarvexVisuCameraType const type) {
    switch (type) {
    case TarvexVisuCamera::CameraPerspective:
        return VizCapture::PerspectiveCamera;
    case TarvexVisuCamera::CameraOrthographic:
        return VizCapture::OrthographicCamera;
    default:
        return VizCapture::UndefinedCamera;
    }
}

void addMembers(TarvexVisuIDIter& ids, VizCapture& capture) {
    while (ids.Next())
        capture.AddMember(ids.Current().ToWString());
}

VizPort::WString bodyPath(TarvexEntity const& body) {
    std::vector<VizPort::WString> instanceNames;
    VizPort::WString partId;
    TarvexEntity current = body;
    for (;;) {
        TarvexVisuEntity partEntity;
        if (current.GetPartEntity(partEntity)) {
            TarvexWString id;
            if (partEntity.GetID(id))
                partId = id.ToWString();
            break;
        }
        TarvexInstanceEntity instanceEntity;
        if (!current.GetInstanceEntity(instanceEntity))
            break; // neither part nor instance: the names so far, without a part id
        instanceNames.push_back(instanceEntity.GetInstance().GetInstanceName().ToWString());
        current = instanceEntity.GetEntity();
    }

    // The scene library splits a path of several instances at this separator; a single
    // instance name stands directly before the part id.
    bool const separated = instanceNames.size() > 1;
    VizPort::WString path;
    for (VizPort::WString const& name : instanceNames) {
        path += name;
        if (separated)
            path += u"<KolbaSlash>";
    }
    return path + partId;
}

} // namespace

VizCaptureLoader::VizCaptureLoader(TarvexVisuCapture const& source,
                                   std::vector<TarvexVisuAttributes>* attributes,
                                   bool const& inheritAttributes)
    : m_inheritAttributes(inheritAttributes), m_attributes(attributes), m_source(&source) {}

KolbaVizCore::VizElement* VizCaptureLoader::loadOne() {
    VizCapture* const capture = makeOne();
    if (capture == nullptr)
        return nullptr;

    // Absent values leave what the scene library gave the new capture.
    bool hidden = false;
    if (m_source->GetHidden(hidden))
        capture->SetHidden(hidden);
    bool active = false;
    if (m_source->GetActive(active))
        capture->SetActive(active);

    TarvexVisuCamera const camera = m_source->GetCamera();
    VizCapture::CameraType const cameraType = toCameraType(camera.GetType());
    capture->SetCameraType(cameraType);
    float position[3] = {};
    float target[3] = {};
    float up[3] = {};
    // Angle and zoom mean nothing without the orientation they apply to.
    if (camera.GetOrientation(position, target, up)) {
        capture->SetOrientation(position, target, up);
        if (cameraType == VizCapture::PerspectiveCamera)
            capture->SetPerspectiveViewAngle(camera.GetPerspectiveViewAngle());
        else if (cameraType == VizCapture::OrthographicCamera)
            capture->SetOrthographicZoomFactor(camera.GetOrthographicZoomFactor());
    }

    capture->SetName(m_source->GetDisplayName().ToWString());
    TarvexWString id;
    if (m_source->GetID(id))
        capture->SetVisualID(id.ToWString());
    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        capture->SetMechanicalID(mechanicalId.ToWString());
    capture->SetHiddenText(m_source->GetHiddenText().ToWString());

    float origin[3] = {};
    float normal[3] = {};
    float first[3] = {};
    if (m_source->GetClippingPlane(origin, normal, first))
        capture->SetClippingPlane(origin, normal, first);

    TarvexVisuIDIter annotations = m_source->GetAnnotationIDIterator();
    TarvexVisuIDIter constructedGeometry = m_source->GetFTACGIDIterator();
    // The hint covers the ids; body paths come on top of it.
    capture->SetMemberCountHint(annotations.GetCount() + constructedGeometry.GetCount());
    addMembers(annotations, *capture);
    addMembers(constructedGeometry, *capture);

    if (m_source->GetManagesGeometry()) {
        TarvexEntityIter bodies = m_source->GetBodyIDIterator();
        while (bodies.Next())
            capture->AddMember(bodyPath(bodies.Current()));
    }
    return capture;
}

} // namespace VizBridgeTarvex

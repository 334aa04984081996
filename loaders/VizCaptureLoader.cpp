#include <VizBridge/loaders/VizCaptureLoader.h>

#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexEntityIter.h>
#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCamera.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEntity.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIDIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>
#include <VizBridge/loaders/TarvexValues.h>

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
        capture.AddMember(textOrEmpty(ids.Current()));
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
                partId = textOrEmpty(id);
            break;
        }
        TarvexInstanceEntity instanceEntity;
        if (!current.GetInstanceEntity(instanceEntity))
            break; // neither part nor instance: the names so far, without a part id
        instanceNames.push_back(textOrEmpty(instanceEntity.GetInstance().GetInstanceName()));
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
    : VizSourceLoader(source, attributes, inheritAttributes) {}

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

    capture->SetName(textOrEmpty(m_source->GetDisplayName()));
    TarvexWString id;
    if (m_source->GetID(id))
        capture->SetVisualID(textOrEmpty(id));
    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        capture->SetMechanicalID(textOrEmpty(mechanicalId));
    capture->SetHiddenText(textOrEmpty(m_source->GetHiddenText()));

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

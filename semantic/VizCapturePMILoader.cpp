#include <VizBridge/semantic/VizCapturePMILoader.h>

#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotationIter.h>
#include <VizBridge/semantic/PMIVocabulary.h>
#include <VizBridge/semantic/SemanticFormat.h>

namespace VizBridgeTarvex {

void VizCapturePMILoader::LoadSemantics() {
    auto const& capture = object<TarvexPMICapture>();
    bool hidden = false;
    bool current = false;
    TarvexWString hiddenText(u"");
    capture.GetAttributes(hidden, current, hiddenText);
    write(u"Hidden", FormatBool(hidden));
    write(u"Current", FormatBool(current));
    write(u"Hidden_Text", ToWString(hiddenText));

    loadCamera(capture);

    float origin[3] = {0, 0, 0};
    float normal[3] = {0, 0, 0};
    if (capture.GetClippingPlane(origin, normal)) {
        write(u"Clip_Origin", FormatFloats(3, origin));
        write(u"Clip_Normal", FormatFloats(3, normal));
    }

    std::vector<WString> ids;
    TarvexPMIAnnotationIter annotations = capture.GetAnnotationIterator();
    while (annotations.Next()) {
        ids.push_back(ToWString(annotations.Current().GetID()));
    }
    write(u"Annotations", JoinStrings(std::move(ids), u", "));

    bool const manages = capture.GetManageHideShowBodyFlag();
    if (manages) {
        loadBodies(capture);
    }
    // The digit, not "true" or "false", and not the number of bodies.
    write(u"Manages_Geometry", FormatInt(manages ? 1 : 0));
}

// A camera of type 0 is no camera: none of its keys is written.
void VizCapturePMILoader::loadCamera(TarvexPMICapture const& capture) {
    TarvexWString name(u"");
    TarvexPMICameraType type = TarvexPMI_Camera_Unknown;
    float position[3] = {0, 0, 0};
    float target[3] = {0, 0, 0};
    float up[3] = {0, 0, 0};
    float angle = 0;
    float zoom = 0;
    capture.GetCamera(name, type, position, target, up, angle, zoom);
    if (type == TarvexPMI_Camera_Unknown) {
        return;
    }
    write(u"Camera_Name", ToWString(name));
    write(u"Camera_Type", CameraTypeToText(type));
    write(u"Camera_Position", FormatFloats(3, position));
    write(u"Camera_Target", FormatFloats(3, target));
    write(u"Camera_UpDirection", FormatFloats(3, up));
    write(u"Camera_Angle", FormatFloat(angle));
    write(u"Camera_Zoom", FormatFloat(zoom));
}

// Each body is followed down through its instances to the entity of a part it stands for;
// a body that ends in no part entity adds nothing.
void VizCapturePMILoader::loadBodies(TarvexPMICapture const& capture) {
    TarvexEntityIter bodies = capture.GetBodyIterator();
    while (bodies.Next()) {
        TarvexEntity entity = bodies.Current();
        TarvexEntity part;
        TarvexInstanceEntity instance;
        while (!entity.GetPartEntity(part) && entity.GetInstanceEntity(instance)) {
            entity = instance.GetEntity();
        }
        if (entity.GetPartEntity(part)) {
            m_entities.push_back(part);
        }
    }
}

} // namespace VizBridgeTarvex

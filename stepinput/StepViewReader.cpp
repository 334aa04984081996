#include <VizBridge/stepinput/StepViewReader.h>

#include <VizBridge/stepinput/StepText.h>

#include <Geom_Axis2Placement.hxx>
#include <Interface_EntityIterator.hxx>
#include <Interface_Graph.hxx>
#include <StepData_GlobalFactors.hxx>
#include <StepData_StepModel.hxx>
#include <StepGeom_Axis2Placement3d.hxx>
#include <StepRepr_MappedItem.hxx>
#include <StepRepr_Representation.hxx>
#include <StepRepr_RepresentationMap.hxx>
#include <StepToGeom.hxx>
#include <StepVisual_AnnotationPlane.hxx>
#include <StepVisual_CameraModelD3.hxx>
#include <StepVisual_CameraModelD3MultiClipping.hxx>
#include <StepVisual_DraughtingCallout.hxx>
#include <StepVisual_PlanarBox.hxx>
#include <StepVisual_TessellatedAnnotationOccurrence.hxx>
#include <StepVisual_ViewVolume.hxx>
#include <gp_Ax2.hxx>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <numbers>

namespace VizBridgeStep {

namespace {

std::array<float, 3> floats(gp_XYZ const& value) {
    return {static_cast<float>(value.X()), static_cast<float>(value.Y()),
            static_cast<float>(value.Z())};
}

std::string millimetres(double const value) {
    char text[32];
    std::snprintf(text, sizeof text, "%.2f", value);
    return text;
}

} // namespace

StepViewReader::StepViewReader(Handle(XSControl_WorkSession) const& session,
                               StepAnnotationReader const& annotations,
                               std::vector<StepPart> const& parts, TarvexModel& model,
                               StepCounts& counts, std::vector<std::string>& notes)
    : m_session(session), m_annotations(annotations), m_parts(parts), m_model(model),
      m_counts(counts), m_notes(notes) {}

void StepViewReader::Read() {
    Handle(Interface_InterfaceModel) const model = m_session->Model();
    int number = 0;
    for (int i = 1; i <= model->NbEntities(); ++i)
        if (model->Value(i)->IsKind(STANDARD_TYPE(StepVisual_CameraModelD3)))
            readView(model->Value(i), ++number);
}

void StepViewReader::readView(Handle(Standard_Transient) const& entity, int const number) {
    Handle(StepVisual_CameraModelD3) const camera =
        Handle(StepVisual_CameraModelD3)::DownCast(entity);
    Handle(StepData_StepModel) const model =
        Handle(StepData_StepModel)::DownCast(m_session->Model());
    std::string const name = "view '" + Narrow(camera->Name()) + "' (#" +
                             std::to_string(model->IdentLabel(entity)) + ")";
    Handle(StepVisual_ViewVolume) const volume = camera->PerspectiveOfVolume();
    if (camera->ViewReferenceSystem().IsNull() || volume.IsNull()) {
        m_notes.push_back(name + " has no placement or view volume and is left out");
        return;
    }

    std::vector<StepAnnotationReader::Placed> shown;
    std::vector<Handle(Standard_Transient)> seen;
    // The graph's TypedSharings would look through any number of entities in between.
    Interface_EntityIterator holders = m_session->Graph().Sharings(entity);
    holders.SelectType(STANDARD_TYPE(StepRepr_Representation), Standard_True);
    for (; holders.More(); holders.Next())
        collectShown(holders.Value(), shown, seen);
    unsigned int referenceId = 0;
    if (!shown.empty()) {
        referenceId = shown.front().referenceId;
        if (std::any_of(shown.begin(), shown.end(), [referenceId](auto const& annotation) {
                return annotation.referenceId != referenceId;
            }))
            m_notes.push_back(name + " shows PMI of several parts; it goes to the part of " +
                              "its first annotation");
    } else if (m_parts.size() == 1) {
        referenceId = m_parts.front().referenceId;
    } else {
        m_notes.push_back(name + " shows no annotation, so no part to go to, and is left out");
        return;
    }

    // The transfer's factor from the file's lengths to millimetres, as for the annotations.
    double const scale = StepData_GlobalFactors::Intance().LengthFactor();
    // The view looks along the z axis of its placement, up along its y axis; its view plane
    // stands that far ahead of it, where the target is.
    gp_Ax2 const axes = StepToGeom::MakeAxis2Placement(camera->ViewReferenceSystem())->Ax2();
    double distance = volume->ViewPlaneDistance() * scale;
    if (!(distance > 0))
        distance = volume->FrontPlaneDistance() * scale;
    gp_XYZ const position = axes.Location().XYZ();
    gp_XYZ const target = position + axes.Direction().XYZ() * (distance > 0 ? distance : 1.0);

    TarvexAuthoredVisuCapture capture;
    capture.displayName = Wide(camera->Name());
    VizPort::WString const referenceText = VizPort::Widen(std::to_string(referenceId));
    capture.id = referenceText + u".View" + VizPort::Widen(std::to_string(number));
    capture.mechanicalId = VizPort::Widen(std::to_string(model->IdentLabel(entity)));
    capture.camera.orientation =
        TarvexVisuTriples{floats(position), floats(target), floats(axes.YDirection().XYZ())};
    Handle(StepVisual_PlanarBox) const window = volume->ViewWindow();
    if (volume->ProjectionType() == StepVisual_copParallel) {
        capture.camera.type = TarvexVisuCamera::CameraOrthographic;
        // Open CASCADE reads the view plane distance as the view's zoom; so does the capture.
        capture.camera.orthographicZoomFactor = static_cast<float>(distance);
    } else {
        capture.camera.type = TarvexVisuCamera::CameraPerspective;
        if (!window.IsNull() && distance > 0)
            capture.camera.perspectiveViewAngle = static_cast<float>(
                2 * std::atan(window->SizeInY() * scale / 2 / distance) * 180 / std::numbers::pi);
    }
    for (StepAnnotationReader::Placed const& annotation : shown)
        capture.annotationIds.push_back(annotation.visualId);

    if (!window.IsNull())
        m_notes.push_back(name + ": its window of " + millimetres(window->SizeInX() * scale) +
                          " x " + millimetres(window->SizeInY() * scale) + " mm is not kept");
    if (volume->FrontPlaneClipping() || volume->BackPlaneClipping() ||
        volume->ViewVolumeSidesClipping() ||
        entity->IsKind(STANDARD_TYPE(StepVisual_CameraModelD3MultiClipping)))
        m_notes.push_back(name + ": its clipping is not kept");

    m_model.FindReference(referenceId)->visu.captures.push_back(std::move(capture));
    ++m_counts.views;
}

void StepViewReader::collectShown(Handle(Standard_Transient) const& item,
                                  std::vector<StepAnnotationReader::Placed>& shown,
                                  std::vector<Handle(Standard_Transient)>& seen) const {
    if (item.IsNull() || std::find(seen.begin(), seen.end(), item) != seen.end())
        return;
    seen.push_back(item);
    if (item->IsKind(STANDARD_TYPE(StepVisual_TessellatedAnnotationOccurrence))) {
        if (StepAnnotationReader::Placed const* const placed = m_annotations.Find(item))
            shown.push_back(*placed);
    } else if (auto const representation = Handle(StepRepr_Representation)::DownCast(item)) {
        if (!representation->Items().IsNull())
            for (Handle(StepRepr_RepresentationItem) const& member : *representation->Items())
                collectShown(member, shown, seen);
    } else if (auto const callout = Handle(StepVisual_DraughtingCallout)::DownCast(item)) {
        for (int i = 1; i <= callout->NbContents(); ++i)
            collectShown(callout->ContentsValue(i).Value(), shown, seen);
    } else if (auto const plane = Handle(StepVisual_AnnotationPlane)::DownCast(item)) {
        for (int i = 1; i <= plane->NbElements(); ++i)
            collectShown(plane->ElementsValue(i).Value(), shown, seen);
    } else if (auto const mapped = Handle(StepRepr_MappedItem)::DownCast(item)) {
        if (!mapped->MappingSource().IsNull())
            collectShown(mapped->MappingSource()->MappedRepresentation(), shown, seen);
    }
}

} // namespace VizBridgeStep

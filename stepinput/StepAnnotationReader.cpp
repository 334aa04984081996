#include <VizBridge/stepinput/StepAnnotationReader.h>

#include <VizBridge/stepinput/StepText.h>

#include <Geom_Axis2Placement.hxx>
#include <Interface_EntityIterator.hxx>
#include <Interface_Graph.hxx>
#include <Interface_UndefinedContent.hxx>
#include <StepAP242_DraughtingModelItemAssociation.hxx>
#include <StepAP242_ItemIdentifiedRepresentationUsage.hxx>
#include <StepData_GlobalFactors.hxx>
#include <StepData_StepModel.hxx>
#include <StepData_UndefinedEntity.hxx>
#include <StepDimTol_AngularityTolerance.hxx>
#include <StepDimTol_CircularRunoutTolerance.hxx>
#include <StepDimTol_CoaxialityTolerance.hxx>
#include <StepDimTol_ConcentricityTolerance.hxx>
#include <StepDimTol_CylindricityTolerance.hxx>
#include <StepDimTol_Datum.hxx>
#include <StepDimTol_DatumFeature.hxx>
#include <StepDimTol_DatumSystem.hxx>
#include <StepDimTol_DatumTarget.hxx>
#include <StepDimTol_FlatnessTolerance.hxx>
#include <StepDimTol_GeneralDatumReference.hxx>
#include <StepDimTol_GeoTolAndGeoTolWthDatRef.hxx>
#include <StepDimTol_GeoTolAndGeoTolWthDatRefAndGeoTolWthMod.hxx>
#include <StepDimTol_GeoTolAndGeoTolWthDatRefAndModGeoTolAndPosTol.hxx>
#include <StepDimTol_GeoTolAndGeoTolWthMod.hxx>
#include <StepDimTol_LineProfileTolerance.hxx>
#include <StepDimTol_ParallelismTolerance.hxx>
#include <StepDimTol_PerpendicularityTolerance.hxx>
#include <StepDimTol_PositionTolerance.hxx>
#include <StepDimTol_RoundnessTolerance.hxx>
#include <StepDimTol_StraightnessTolerance.hxx>
#include <StepDimTol_SurfaceProfileTolerance.hxx>
#include <StepDimTol_SymmetryTolerance.hxx>
#include <StepDimTol_ToleranceZone.hxx>
#include <StepDimTol_TotalRunoutTolerance.hxx>
#include <StepGeom_Axis2Placement3d.hxx>
#include <StepRepr_FeatureForDatumTargetRelationship.hxx>
#include <StepRepr_PropertyDefinition.hxx>
#include <StepShape_AngularLocation.hxx>
#include <StepShape_AngularSize.hxx>
#include <StepShape_DimensionalLocation.hxx>
#include <StepShape_DimensionalSize.hxx>
#include <StepShape_Face.hxx>
#include <StepToGeom.hxx>
#include <StepVisual_AnnotationCurveOccurrence.hxx>
#include <StepVisual_AnnotationFillAreaOccurrence.hxx>
#include <StepVisual_AnnotationTextOccurrence.hxx>
#include <StepVisual_ColourRgb.hxx>
#include <StepVisual_CoordinatesList.hxx>
#include <StepVisual_CurveStyle.hxx>
#include <StepVisual_DraughtingCallout.hxx>
#include <StepVisual_PreDefinedColour.hxx>
#include <StepVisual_PreDefinedItem.hxx>
#include <StepVisual_PresentationStyleAssignment.hxx>
#include <StepVisual_TessellatedAnnotationOccurrence.hxx>
#include <StepVisual_TessellatedCurveSet.hxx>
#include <StepVisual_TessellatedGeometricSet.hxx>
#include <TColStd_HSequenceOfInteger.hxx>
#include <TColgp_HArray1OfXYZ.hxx>
#include <TopoDS.hxx>
#include <TransferBRep.hxx>
#include <Transfer_TransientProcess.hxx>
#include <XSControl_TransferReader.hxx>
#include <gp_Ax2.hxx>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstring>
#include <optional>
#include <set>

namespace VizBridgeStep {

namespace {

using NodeType = TarvexVisuNode::TarvexVisuNodeType;
using Rgb = std::array<unsigned short, 3>;

VizPort::WString idText(long long const id) {
    return VizPort::Widen(std::to_string(id));
}

/// Where the points of an annotation go: its placement, and the factor from the file's length
/// unit to millimetres.
struct Placement {
    gp_Ax2 axes;
    double scale = 1;

    gp_XYZ At(gp_XYZ const& local) const {
        return axes.Location().XYZ() +
               scale * (local.X() * axes.XDirection().XYZ() + local.Y() * axes.YDirection().XYZ() +
                        local.Z() * axes.Direction().XYZ());
    }
};

void addPoint(std::vector<float>& out, gp_XYZ const& point) {
    out.insert(out.end(), {static_cast<float>(point.X()), static_cast<float>(point.Y()),
                           static_cast<float>(point.Z())});
}

std::array<float, 3> floats(gp_XYZ const& value) {
    return {static_cast<float>(value.X()), static_cast<float>(value.Y()),
            static_cast<float>(value.Z())};
}

/// The part called `type` of an entity that Open CASCADE keeps unread, or null.
Handle(StepData_UndefinedEntity) partOf(Handle(StepData_UndefinedEntity) entity, char const* type) {
    for (; !entity.IsNull(); entity = entity->Next())
        if (std::strcmp(entity->StepType(), type) == 0)
            return entity;
    return nullptr;
}

/// Parameter `index` of an unread entity when it is a list, or null.
Handle(StepData_UndefinedEntity)
    listParam(Handle(StepData_UndefinedEntity) const& entity, int const index) {
    Handle(Interface_UndefinedContent) const content = entity->UndefinedContent();
    if (index > content->NbParams() || content->ParamType(index) != Interface_ParamSub)
        return nullptr;
    return Handle(StepData_UndefinedEntity)::DownCast(content->ParamEntity(index));
}

std::vector<int> integers(Handle(StepData_UndefinedEntity) const& list) {
    std::vector<int> values;
    if (list.IsNull())
        return values;
    Handle(Interface_UndefinedContent) const content = list->UndefinedContent();
    for (int i = 1; i <= content->NbParams(); ++i)
        if (content->ParamType(i) == Interface_ParamInteger)
            values.push_back(content->ParamValue(i)->IntegerValue());
    return values;
}

std::vector<std::vector<int>> integerLists(Handle(StepData_UndefinedEntity) const& list) {
    std::vector<std::vector<int>> values;
    if (list.IsNull())
        return values;
    for (int i = 1; i <= list->UndefinedContent()->NbParams(); ++i)
        values.push_back(integers(listParam(list, i)));
    return values;
}

/// The points of a coordinates list, placed.
std::vector<float> placedPoints(Handle(StepVisual_CoordinatesList) const& list,
                                Placement const& placement) {
    std::vector<float> points;
    Handle(TColgp_HArray1OfXYZ) const raw = list.IsNull() ? nullptr : list->Points();
    if (raw.IsNull())
        return points;
    points.reserve(3 * static_cast<std::size_t>(raw->Length()));
    for (int i = raw->Lower(); i <= raw->Upper(); ++i)
        addPoint(points, placement.At(raw->Value(i)));
    return points;
}

/// The polylines of a tessellated curve set as edges. Indices run from 1; those past the
/// coordinates are left out and counted in `outside`.
void addCurves(StepVisual_TessellatedCurveSet const& set, Placement const& placement,
               std::optional<Rgb> const& color, std::vector<TarvexAuthoredVisuEdge>& edges,
               int& outside) {
    std::vector<float> const points = placedPoints(set.CoordList(), placement);
    int const count = static_cast<int>(points.size() / 3);
    NCollection_Handle<StepVisual_VectorOfHSequenceOfInteger> const curves = set.Curves();
    if (curves.IsNull())
        return;
    for (StepVisual_VectorOfHSequenceOfInteger::Iterator curve(*curves); curve.More();
         curve.Next()) {
        TarvexAuthoredVisuEdge edge;
        edge.lineType = TarvexVisuLine_Polyline;
        edge.rgb = color;
        std::vector<int>& indices = edge.lineIndices.emplace();
        for (int const index : *curve.Value()) {
            if (index < 1 || index > count) {
                ++outside;
                continue;
            }
            indices.push_back(static_cast<int>(edge.points.size()));
            edge.points.insert(edge.points.end(), points.begin() + 3 * (index - 1),
                               points.begin() + 3 * index);
        }
        if (indices.size() >= 2)
            edges.push_back(std::move(edge));
    }
}

/// The filled triangles of a complex triangulated surface set (which Open CASCADE 7.6 does not
/// read: its parameters are name, coordinates, pnmax, normals, pnindex, strips, fans) as one
/// face facing the placement's z axis, which is what the glyphs are drawn to face. Gives the
/// number of triangles; corners past the coordinates are counted in `outside`.
int addTriangles(Handle(StepData_UndefinedEntity) const& set, Placement const& placement,
                 std::optional<Rgb> const& color, std::vector<TarvexAuthoredVisuFace>& faces,
                 int& outside) {
    Handle(Interface_UndefinedContent) const content = set->UndefinedContent();
    if (content->NbParams() < 7 || content->ParamType(2) != Interface_ParamIdent)
        return 0;
    TarvexAuthoredVisuFace face;
    face.rgb = color;
    face.vertices = placedPoints(
        Handle(StepVisual_CoordinatesList)::DownCast(content->ParamEntity(2)), placement);
    int const count = static_cast<int>(face.vertices.size() / 3);
    std::array<float, 3> const normal = floats(placement.axes.Direction().XYZ());
    for (int i = 0; i < count; ++i)
        face.normals.insert(face.normals.end(), normal.begin(), normal.end());

    // Without pnindex, the indices of strips and fans go straight into the coordinates.
    std::vector<int> const pnindex = integers(listParam(set, 5));
    auto const corner = [&](int const index) {
        int const point = pnindex.empty() ? index
                                          : (index >= 1 && index <= static_cast<int>(pnindex.size())
                                                 ? pnindex[static_cast<std::size_t>(index - 1)]
                                                 : 0);
        return point >= 1 && point <= count ? point - 1 : -1;
    };
    std::vector<int> offsets;
    auto const addTriangle = [&](int const a, int const b, int const c) {
        int const corners[] = {corner(a), corner(b), corner(c)};
        if (corners[0] < 0 || corners[1] < 0 || corners[2] < 0) {
            ++outside;
            return;
        }
        // A corner used twice marks the join of two strips, or an empty fan: no triangle.
        if (corners[0] == corners[1] || corners[1] == corners[2] || corners[0] == corners[2])
            return;
        for (int const point : corners)
            offsets.push_back(3 * point);
    };
    for (std::vector<int> const& strip : integerLists(listParam(set, 6)))
        for (std::size_t i = 0; i + 2 < strip.size(); ++i)
            // Every second triangle of a strip runs the other way round.
            if (i % 2 == 0)
                addTriangle(strip[i], strip[i + 1], strip[i + 2]);
            else
                addTriangle(strip[i + 1], strip[i], strip[i + 2]);
    for (std::vector<int> const& fan : integerLists(listParam(set, 7)))
        for (std::size_t i = 1; i + 1 < fan.size(); ++i)
            addTriangle(fan[0], fan[i], fan[i + 1]);
    if (offsets.empty())
        return 0;
    int const triangles = static_cast<int>(offsets.size() / 3);
    face.polygons.push_back(
        TarvexAuthoredVisuPolygon{std::move(offsets), TarvexVisuPolygon_Triangles});
    faces.push_back(std::move(face));
    return triangles;
}

std::optional<Rgb> rgbOf(Handle(StepVisual_Colour) const& colour) {
    auto const byte = [](double const value) {
        return static_cast<unsigned short>(std::lround(std::clamp(value, 0.0, 1.0) * 255.0));
    };
    if (Handle(StepVisual_ColourRgb) const rgb = Handle(StepVisual_ColourRgb)::DownCast(colour))
        return Rgb{byte(rgb->Red()), byte(rgb->Green()), byte(rgb->Blue())};
    Handle(StepVisual_PreDefinedColour) const named =
        Handle(StepVisual_PreDefinedColour)::DownCast(colour);
    if (named.IsNull() || named->GetPreDefinedItem().IsNull())
        return std::nullopt;
    struct Named {
        char const* name;
        Rgb rgb;
    };
    static constexpr Named kNamed[] = {
        {"black", {0, 0, 0}},    {"red", {255, 0, 0}},       {"green", {0, 255, 0}},
        {"blue", {0, 0, 255}},   {"yellow", {255, 255, 0}},  {"magenta", {255, 0, 255}},
        {"cyan", {0, 255, 255}}, {"white", {255, 255, 255}},
    };
    std::string const name = Narrow(named->GetPreDefinedItem()->Name());
    for (Named const& candidate : kNamed)
        if (name == candidate.name)
            return candidate.rgb;
    return std::nullopt;
}

/// The colour of the annotation's curve style, if it has one.
std::optional<Rgb> curveColour(StepVisual_StyledItem const& occurrence) {
    Handle(StepVisual_HArray1OfPresentationStyleAssignment) const styles = occurrence.Styles();
    if (styles.IsNull())
        return std::nullopt;
    for (int i = styles->Lower(); i <= styles->Upper(); ++i) {
        Handle(StepVisual_PresentationStyleAssignment) const assignment = styles->Value(i);
        if (assignment.IsNull() || assignment->Styles().IsNull())
            continue;
        for (int j = 1; j <= assignment->NbStyles(); ++j) {
            Handle(StepVisual_CurveStyle) const curve = assignment->StylesValue(j).CurveStyle();
            if (!curve.IsNull())
                if (std::optional<Rgb> const rgb = rgbOf(curve->CurveColour()))
                    return rgb;
        }
    }
    return std::nullopt;
}

struct ToleranceKind {
    StepDimTol_GeometricToleranceType kind;
    Handle(Standard_Type) type; ///< the entity of that kind alone
    char const* stepName;
    NodeType node;
};

std::vector<ToleranceKind> const& toleranceKinds() {
    static std::vector<ToleranceKind> const kinds = {
        {StepDimTol_GTTAngularityTolerance, STANDARD_TYPE(StepDimTol_AngularityTolerance),
         "ANGULARITY_TOLERANCE", TarvexVisuNode::VisuGeomTolAngularity},
        {StepDimTol_GTTCircularRunoutTolerance, STANDARD_TYPE(StepDimTol_CircularRunoutTolerance),
         "CIRCULAR_RUNOUT_TOLERANCE", TarvexVisuNode::VisuGeomTolCircularRunout},
        {StepDimTol_GTTCoaxialityTolerance, STANDARD_TYPE(StepDimTol_CoaxialityTolerance),
         "COAXIALITY_TOLERANCE", TarvexVisuNode::VisuGeomTolCoaxiality},
        {StepDimTol_GTTConcentricityTolerance, STANDARD_TYPE(StepDimTol_ConcentricityTolerance),
         "CONCENTRICITY_TOLERANCE", TarvexVisuNode::VisuGeomTolConcentricity},
        {StepDimTol_GTTCylindricityTolerance, STANDARD_TYPE(StepDimTol_CylindricityTolerance),
         "CYLINDRICITY_TOLERANCE", TarvexVisuNode::VisuGeomTolCylindricity},
        {StepDimTol_GTTFlatnessTolerance, STANDARD_TYPE(StepDimTol_FlatnessTolerance),
         "FLATNESS_TOLERANCE", TarvexVisuNode::VisuGeomTolFlatness},
        {StepDimTol_GTTLineProfileTolerance, STANDARD_TYPE(StepDimTol_LineProfileTolerance),
         "LINE_PROFILE_TOLERANCE", TarvexVisuNode::VisuGeomTolLineProfile},
        {StepDimTol_GTTParallelismTolerance, STANDARD_TYPE(StepDimTol_ParallelismTolerance),
         "PARALLELISM_TOLERANCE", TarvexVisuNode::VisuGeomTolParallelism},
        {StepDimTol_GTTPerpendicularityTolerance,
         STANDARD_TYPE(StepDimTol_PerpendicularityTolerance), "PERPENDICULARITY_TOLERANCE",
         TarvexVisuNode::VisuGeomTolPerpendicularity},
        {StepDimTol_GTTPositionTolerance, STANDARD_TYPE(StepDimTol_PositionTolerance),
         "POSITION_TOLERANCE", TarvexVisuNode::VisuGeomTolPosition},
        {StepDimTol_GTTRoundnessTolerance, STANDARD_TYPE(StepDimTol_RoundnessTolerance),
         "ROUNDNESS_TOLERANCE", TarvexVisuNode::VisuGeomTolCircularity},
        {StepDimTol_GTTStraightnessTolerance, STANDARD_TYPE(StepDimTol_StraightnessTolerance),
         "STRAIGHTNESS_TOLERANCE", TarvexVisuNode::VisuGeomTolStraightness},
        {StepDimTol_GTTSurfaceProfileTolerance, STANDARD_TYPE(StepDimTol_SurfaceProfileTolerance),
         "SURFACE_PROFILE_TOLERANCE", TarvexVisuNode::VisuGeomTolSurfaceProfile},
        {StepDimTol_GTTSymmetryTolerance, STANDARD_TYPE(StepDimTol_SymmetryTolerance),
         "SYMMETRY_TOLERANCE", TarvexVisuNode::VisuGeomTolSymmetry},
        {StepDimTol_GTTTotalRunoutTolerance, STANDARD_TYPE(StepDimTol_TotalRunoutTolerance),
         "TOTAL_RUNOUT_TOLERANCE", TarvexVisuNode::VisuGeomTolTotalRunout},
    };
    return kinds;
}

/// The kind of a tolerance that Open CASCADE reads as one of its complex entities, which name
/// the kind in a field rather than in their type.
std::optional<StepDimTol_GeometricToleranceType> complexToleranceKind(Handle(Standard_Transient)
                                                                          const& entity) {
    if (auto const tolerance = Handle(StepDimTol_GeoTolAndGeoTolWthDatRef)::DownCast(entity))
        return tolerance->GetToleranceType();
    if (auto const tolerance = Handle(StepDimTol_GeoTolAndGeoTolWthMod)::DownCast(entity))
        return tolerance->GetToleranceType();
    if (auto const tolerance =
            Handle(StepDimTol_GeoTolAndGeoTolWthDatRefAndGeoTolWthMod)::DownCast(entity))
        return tolerance->GetToleranceType();
    if (entity->IsKind(STANDARD_TYPE(StepDimTol_GeoTolAndGeoTolWthDatRefAndModGeoTolAndPosTol)))
        return StepDimTol_GTTPositionTolerance;
    return std::nullopt;
}

NodeType sizeNode(std::string const& kind) {
    if (kind.find("diameter") != std::string::npos)
        return TarvexVisuNode::VisuDimensionDiameter;
    if (kind.find("radius") != std::string::npos)
        return TarvexVisuNode::VisuDimensionRadius;
    if (kind == "curve length")
        return TarvexVisuNode::VisuDimensionCurvilinear;
    return TarvexVisuNode::VisuDimensionLength;
}

NodeType locationNode(std::string const& kind) {
    return kind == "curved distance" ? TarvexVisuNode::VisuDimensionCurvilinear
                                     : TarvexVisuNode::VisuDimensionDistance;
}

/// What an entity that Open CASCADE keeps unread shows, by the names of its parts.
std::optional<NodeType> unreadNode(Handle(StepData_UndefinedEntity) const& entity) {
    for (ToleranceKind const& kind : toleranceKinds())
        if (!partOf(entity, kind.stepName).IsNull())
            return kind.node;
    if (!partOf(entity, "GEOMETRIC_TOLERANCE").IsNull())
        return TarvexVisuNode::VisuGeomTolOther;
    if (!partOf(entity, "ANGULAR_SIZE").IsNull() || !partOf(entity, "ANGULAR_LOCATION").IsNull())
        return TarvexVisuNode::VisuDimensionAngle;
    if (!partOf(entity, "DIMENSIONAL_SIZE").IsNull())
        return TarvexVisuNode::VisuDimensionLength;
    if (!partOf(entity, "DIMENSIONAL_LOCATION").IsNull())
        return TarvexVisuNode::VisuDimensionDistance;
    if (!partOf(entity, "DATUM_FEATURE").IsNull())
        return TarvexVisuNode::VisuDatumFeature;
    if (!partOf(entity, "PLACED_DATUM_TARGET_FEATURE").IsNull())
        return TarvexVisuNode::VisuDatumTarget;
    return std::nullopt;
}

/// The node type of what an association ties to an annotation; none for a mere shape aspect,
/// which says where the annotation points but not what it is.
std::optional<NodeType> nodeTypeOf(Handle(Standard_Transient) const& definition) {
    if (definition->IsKind(STANDARD_TYPE(StepShape_AngularSize)) ||
        definition->IsKind(STANDARD_TYPE(StepShape_AngularLocation)))
        return TarvexVisuNode::VisuDimensionAngle;
    if (auto const size = Handle(StepShape_DimensionalSize)::DownCast(definition))
        return sizeNode(Narrow(size->Name()));
    if (auto const location = Handle(StepShape_DimensionalLocation)::DownCast(definition))
        return locationNode(Narrow(location->Name()));
    if (definition->IsKind(STANDARD_TYPE(StepDimTol_GeometricTolerance))) {
        std::optional<StepDimTol_GeometricToleranceType> const kind =
            complexToleranceKind(definition);
        for (ToleranceKind const& candidate : toleranceKinds())
            if (kind ? *kind == candidate.kind : definition->IsKind(candidate.type))
                return candidate.node;
        return TarvexVisuNode::VisuGeomTolOther;
    }
    if (definition->IsKind(STANDARD_TYPE(StepDimTol_DatumTarget)))
        return TarvexVisuNode::VisuDatumTarget;
    if (definition->IsKind(STANDARD_TYPE(StepDimTol_DatumFeature)))
        return TarvexVisuNode::VisuDatumFeature;
    // A property shown as an annotation is a note: the files tie their texts that way.
    if (definition->IsKind(STANDARD_TYPE(StepRepr_PropertyDefinition)))
        return TarvexVisuNode::VisuNote;
    if (auto const unread = Handle(StepData_UndefinedEntity)::DownCast(definition))
        return unreadNode(unread);
    return std::nullopt;
}

/// Shape aspects that a tolerance or dimension names without pointing at its geometry: the
/// datums it refers to, their systems and its tolerance zone.
bool isReferenceOnly(Handle(Standard_Transient) const& aspect) {
    return aspect->IsKind(STANDARD_TYPE(StepDimTol_DatumSystem)) ||
           aspect->IsKind(STANDARD_TYPE(StepDimTol_GeneralDatumReference)) ||
           aspect->IsKind(STANDARD_TYPE(StepDimTol_ToleranceZone)) ||
           aspect->IsKind(STANDARD_TYPE(StepDimTol_Datum));
}

/// The entities of kind `type` that refer to `entity` themselves. (The graph's TypedSharings
/// looks through any number of entities in between.)
Interface_EntityIterator sharingsOfKind(Interface_Graph const& graph,
                                        Handle(Standard_Transient) const& entity,
                                        Handle(Standard_Type) const& type) {
    Interface_EntityIterator sharings = graph.Sharings(entity);
    sharings.SelectType(type, Standard_True);
    return sharings;
}

bool contains(std::vector<Handle(Standard_Transient)> const& entities,
              Handle(Standard_Transient) const& entity) {
    return std::find(entities.begin(), entities.end(), entity) != entities.end();
}

} // namespace

StepAnnotationReader::StepAnnotationReader(Handle(XSControl_WorkSession) const& session,
                                           StepUnboundItems& unbound,
                                           std::vector<StepPart> const& parts, TarvexModel& model,
                                           StepCounts& counts, std::vector<std::string>& notes)
    : m_session(session), m_unbound(unbound), m_parts(parts), m_model(model), m_counts(counts),
      m_notes(notes) {}

void StepAnnotationReader::Read() {
    // The factor the transfer used for the file's lengths: the annotations' points are read
    // raw and must land where the parts' geometry did.
    m_lengthFactor = StepData_GlobalFactors::Intance().LengthFactor();
    for (std::size_t part = 0; part < m_parts.size(); ++part)
        for (int face = 1; face <= m_parts[part].faces.Extent(); ++face)
            m_faces.emplace(m_parts[part].faces(face).TShape().get(), FaceOfPart{part, face});

    Handle(StepData_StepModel) const model =
        Handle(StepData_StepModel)::DownCast(m_session->Model());

    int polylinePresentations = 0;
    for (int i = 1; i <= model->NbEntities(); ++i) {
        Handle(Standard_Transient) const entity = model->Value(i);
        if (entity->IsKind(STANDARD_TYPE(StepVisual_TessellatedAnnotationOccurrence)))
            readOccurrence(entity);
        else if (entity->IsKind(STANDARD_TYPE(StepVisual_AnnotationCurveOccurrence)) ||
                 entity->IsKind(STANDARD_TYPE(StepVisual_AnnotationTextOccurrence)) ||
                 entity->IsKind(STANDARD_TYPE(StepVisual_AnnotationFillAreaOccurrence)))
            ++polylinePresentations;
    }
    if (polylinePresentations > 0)
        m_notes.push_back(std::to_string(polylinePresentations) +
                          " annotation curves, texts and fill areas of polyline PMI are not read");
}

StepAnnotationReader::Placed const* StepAnnotationReader::Find(Handle(Standard_Transient)
                                                                   const& occurrence) const {
    auto const found = m_placed.find(occurrence.get());
    return found == m_placed.end() ? nullptr : &found->second;
}

std::string StepAnnotationReader::describe(Handle(Standard_Transient) const& occurrence) const {
    Handle(StepData_StepModel) const model =
        Handle(StepData_StepModel)::DownCast(m_session->Model());
    return "annotation '" + Narrow(Handle(StepVisual_StyledItem)::DownCast(occurrence)->Name()) +
           "' (#" + std::to_string(model->IdentLabel(occurrence)) + ")";
}

void StepAnnotationReader::readOccurrence(Handle(Standard_Transient) const& entity) {
    Handle(StepVisual_TessellatedAnnotationOccurrence) const occurrence =
        Handle(StepVisual_TessellatedAnnotationOccurrence)::DownCast(entity);
    Handle(StepData_StepModel) const model =
        Handle(StepData_StepModel)::DownCast(m_session->Model());
    Interface_Graph const& graph = m_session->Graph();

    // The presentation: a tessellated geometric set, most often repositioned by a placement
    // of its own, which 7.6 keeps unread as a complex entity.
    Placement placement;
    placement.scale = m_lengthFactor;
    std::vector<Handle(Standard_Transient)> children;
    Handle(Standard_Transient) item(occurrence->Item());
    if (item.IsNull())
        item = m_unbound.ItemOf(entity);
    if (auto const complex = Handle(StepData_UndefinedEntity)::DownCast(item)) {
        Handle(StepData_UndefinedEntity) const located =
            partOf(complex, "REPOSITIONED_TESSELLATED_ITEM");
        if (!located.IsNull() && located->UndefinedContent()->NbParams() >= 1) {
            auto const axes = Handle(StepGeom_Axis2Placement3d)::DownCast(
                located->UndefinedContent()->ParamEntity(1));
            if (!axes.IsNull())
                placement.axes = StepToGeom::MakeAxis2Placement(axes)->Ax2();
        }
        Handle(StepData_UndefinedEntity) const set = partOf(complex, "TESSELLATED_GEOMETRIC_SET");
        Handle(StepData_UndefinedEntity) const list = set.IsNull() ? nullptr : listParam(set, 1);
        for (int i = 1; !list.IsNull() && i <= list->UndefinedContent()->NbParams(); ++i)
            children.push_back(list->UndefinedContent()->ParamEntity(i));
    } else if (auto const set = Handle(StepVisual_TessellatedGeometricSet)::DownCast(item)) {
        if (!set->Items().IsNull())
            for (Handle(StepVisual_TessellatedItem) const& child : *set->Items())
                children.push_back(child);
    }

    std::optional<Rgb> const color = curveColour(*occurrence);
    TarvexAuthoredVisuNode node;
    node.pmi.displayName = Wide(occurrence->Name());
    std::vector<TarvexAuthoredVisuFace> glyphs;
    int outside = 0;
    int unknown = 0;
    for (Handle(Standard_Transient) const& child : children) {
        auto const unread = Handle(StepData_UndefinedEntity)::DownCast(child);
        if (auto const curves = Handle(StepVisual_TessellatedCurveSet)::DownCast(child))
            addCurves(*curves, placement, color, node.pmi.edges, outside);
        else if (!unread.IsNull() && !unread->IsComplex() &&
                 std::strcmp(unread->StepType(), "COMPLEX_TRIANGULATED_SURFACE_SET") == 0)
            addTriangles(unread, placement, color, glyphs, outside);
        else
            ++unknown;
    }
    if (unknown > 0)
        m_notes.push_back(describe(entity) + ": " + std::to_string(unknown) +
                          " tessellated items other than curve and triangle sets are left out");
    if (outside > 0)
        m_notes.push_back(describe(entity) + ": " + std::to_string(outside) +
                          " indices past its coordinates are left out");
    if (node.pmi.edges.empty() && glyphs.empty()) {
        m_notes.push_back(describe(entity) + " has no tessellated geometry and is left out");
        return;
    }

    // What it shows, tied by an association to the annotation or to a callout holding it.
    std::vector<Handle(Standard_Transient)> holders{entity};
    for (Interface_EntityIterator callouts =
             sharingsOfKind(graph, entity, STANDARD_TYPE(StepVisual_DraughtingCallout));
         callouts.More(); callouts.Next())
        holders.push_back(callouts.Value());
    std::vector<Handle(Standard_Transient)> definitions;
    for (Handle(Standard_Transient) const& holder : holders)
        for (Interface_EntityIterator associations = sharingsOfKind(
                 graph, holder, STANDARD_TYPE(StepAP242_DraughtingModelItemAssociation));
             associations.More(); associations.Next()) {
            Handle(Standard_Transient) const definition =
                Handle(StepAP242_DraughtingModelItemAssociation)::DownCast(associations.Value())
                    ->Definition()
                    .Value();
            if (!definition.IsNull() && !contains(definitions, definition))
                definitions.push_back(definition);
        }
    node.type = TarvexVisuNode::VisuPMI;
    Handle(Standard_Transient) shown = entity;
    for (Handle(Standard_Transient) const& definition : definitions) {
        if (std::optional<NodeType> const type = nodeTypeOf(definition)) {
            node.type = *type;
            shown = definition;
            break;
        }
    }
    node.pmi.mechanicalId = idText(model->IdentLabel(shown));

    std::vector<FaceOfPart> faces;
    int unresolved = 0;
    int others = 0;
    collectFaces(definitions, faces, unresolved, others);
    if (unresolved > 0)
        m_notes.push_back(describe(entity) + " points at " + std::to_string(unresolved) +
                          " faces that no part holds");
    if (others > 0)
        m_notes.push_back(describe(entity) + " points at " + std::to_string(others) +
                          " items other than faces, which are not linked");

    std::size_t part = 0;
    if (!faces.empty()) {
        part = faces.front().first;
        if (std::any_of(faces.begin(), faces.end(),
                        [part](FaceOfPart const& face) { return face.first != part; }))
            m_notes.push_back(describe(entity) + " points at faces of several parts; it goes " +
                              "to the part of its first face, linked to that part's faces only");
    } else if (m_parts.size() != 1) {
        m_notes.push_back(describe(entity) + " points at no face of a part and is left out");
        return;
    }
    StepPart const& owner = m_parts[part];
    VizPort::WString const referenceText = idText(owner.referenceId);
    for (FaceOfPart const& face : faces) {
        if (face.first != part)
            continue;
        TarvexAuthoredEntity linked;
        linked.entityId = static_cast<unsigned int>(face.second);
        linked.visualId = referenceText + u"." + idText(face.second);
        node.pmi.linkedElements.push_back(std::move(linked));
    }

    node.pmi.id = referenceText + u".PMI" + idText(model->IdentLabel(entity));
    if (!glyphs.empty()) {
        TarvexAuthoredVisuText& text = node.pmi.texts.emplace_back();
        // The files hold no string: the name stands for the text where it is not drawn.
        text.text = node.pmi.displayName->empty() ? *node.pmi.id : *node.pmi.displayName;
        text.anchor = floats(placement.axes.Location().XYZ());
        text.direction = floats(placement.axes.XDirection().XYZ());
        text.normal = floats(placement.axes.Direction().XYZ());
        text.rgb = color;
        text.glyphs = TarvexAuthoredVisuGlyphs{{}, std::move(glyphs)};
    }
    m_placed[entity.get()] = Placed{owner.referenceId, *node.pmi.id};
    m_model.FindReference(owner.referenceId)->visu.nodes.push_back(std::move(node));
    ++m_counts.pmi;
}

void StepAnnotationReader::collectFaces(std::vector<Handle(Standard_Transient)> const& definitions,
                                        std::vector<FaceOfPart>& faces, int& unresolved,
                                        int& others) const {
    Interface_Graph const& graph = m_session->Graph();
    std::vector<Handle(Standard_Transient)> aspects;
    for (Handle(Standard_Transient) const& definition : definitions) {
        // A shape aspect (a datum feature too) points at geometry itself; a dimension or
        // tolerance through the aspects it names, a tolerance of a dimension through the
        // dimension's.
        if (definition->IsKind(STANDARD_TYPE(StepRepr_ShapeAspect))) {
            aspects.push_back(definition);
            continue;
        }
        for (Interface_EntityIterator named = graph.Shareds(definition); named.More();
             named.Next()) {
            Handle(Standard_Transient) const value = named.Value();
            if (value->IsKind(STANDARD_TYPE(StepRepr_ShapeAspect)) && !isReferenceOnly(value))
                aspects.push_back(value);
            else if (value->IsKind(STANDARD_TYPE(StepShape_DimensionalSize)) ||
                     value->IsKind(STANDARD_TYPE(StepShape_DimensionalLocation)))
                for (Interface_EntityIterator inner = graph.Shareds(value); inner.More();
                     inner.Next())
                    if (inner.Value()->IsKind(STANDARD_TYPE(StepRepr_ShapeAspect)) &&
                        !isReferenceOnly(inner.Value()))
                        aspects.push_back(inner.Value());
        }
    }
    std::vector<Handle(Standard_Transient)> items;
    std::vector<Handle(Standard_Transient)> seen;
    for (Handle(Standard_Transient) const& aspect : aspects)
        collectAspectItems(aspect, items, seen);

    Handle(Transfer_TransientProcess) const process =
        m_session->TransferReader()->TransientProcess();
    std::set<FaceOfPart> found;
    for (Handle(Standard_Transient) const& item : items) {
        if (!item->IsKind(STANDARD_TYPE(StepShape_Face))) {
            ++others;
            continue;
        }
        TopoDS_Shape const shape = TransferBRep::ShapeResult(process, item);
        auto const face = shape.IsNull() ? m_faces.end() : m_faces.find(shape.TShape().get());
        if (face == m_faces.end())
            ++unresolved;
        else
            found.insert(face->second);
    }
    faces.assign(found.begin(), found.end());
}

void StepAnnotationReader::collectAspectItems(Handle(Standard_Transient) const& aspect,
                                              std::vector<Handle(Standard_Transient)>& items,
                                              std::vector<Handle(Standard_Transient)>& seen) const {
    if (contains(seen, aspect))
        return;
    seen.push_back(aspect);
    Interface_Graph const& graph = m_session->Graph();
    for (Interface_EntityIterator usages = sharingsOfKind(
             graph, aspect, STANDARD_TYPE(StepAP242_ItemIdentifiedRepresentationUsage));
         usages.More(); usages.Next()) {
        // Associations are usages too, but name the annotation, not geometry.
        if (usages.Value()->IsKind(STANDARD_TYPE(StepAP242_DraughtingModelItemAssociation)))
            continue;
        auto const usage =
            Handle(StepAP242_ItemIdentifiedRepresentationUsage)::DownCast(usages.Value());
        if (usage->Definition().Value() != aspect || usage->IdentifiedItem().IsNull())
            continue;
        for (Handle(StepRepr_RepresentationItem) const& item : *usage->IdentifiedItem())
            if (!item.IsNull() && !contains(items, item))
                items.push_back(item);
    }
    // A composite aspect points through its members, a datum target through the feature it
    // lies on; the datums that features and targets establish are no part of them.
    bool const feature = aspect->IsKind(STANDARD_TYPE(StepDimTol_DatumFeature)) ||
                         aspect->IsKind(STANDARD_TYPE(StepDimTol_DatumTarget));
    for (Interface_EntityIterator relations =
             sharingsOfKind(graph, aspect, STANDARD_TYPE(StepRepr_ShapeAspectRelationship));
         relations.More(); relations.Next()) {
        auto const relation = Handle(StepRepr_ShapeAspectRelationship)::DownCast(relations.Value());
        if (relation->IsKind(STANDARD_TYPE(StepRepr_FeatureForDatumTargetRelationship))) {
            if (relation->RelatedShapeAspect() == aspect)
                collectAspectItems(relation->RelatingShapeAspect(), items, seen);
        } else if (!feature && !relation->IsKind(STANDARD_TYPE(StepShape_DimensionalLocation)) &&
                   relation->RelatingShapeAspect() == aspect &&
                   !relation->RelatedShapeAspect().IsNull() &&
                   !relation->RelatedShapeAspect()->IsKind(STANDARD_TYPE(StepDimTol_Datum))) {
            collectAspectItems(relation->RelatedShapeAspect(), items, seen);
        }
    }
}

} // namespace VizBridgeStep

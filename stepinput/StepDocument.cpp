#include <VizBridge/stepinput/StepDocument.h>

#include <VizBridge/stepinput/StepAnnotationReader.h>
#include <VizBridge/stepinput/StepFileCheck.h>
#include <VizBridge/stepinput/StepGdtReferences.h>
#include <VizBridge/stepinput/StepPartMesher.h>
#include <VizBridge/stepinput/StepReadError.h>
#include <VizBridge/stepinput/StepStructureReader.h>
#include <VizBridge/stepinput/StepText.h>
#include <VizBridge/stepinput/StepViewReader.h>
#include <VizBridge/stepinput/XcafDocument.h>

#include <HeaderSection_FileDescription.hxx>
#include <HeaderSection_FileName.hxx>
#include <Interface_Check.hxx>
#include <Interface_CheckIterator.hxx>
#include <Message.hxx>
#include <Message_Messenger.hxx>
#include <Message_PrinterOStream.hxx>
#include <STEPCAFControl_Reader.hxx>
#include <Standard_Failure.hxx>
#include <StepData_StepModel.hxx>
#include <StepVisual_FillAreaStyle.hxx>
#include <StepVisual_SurfaceStyleUsage.hxx>
#include <TColStd_SequenceOfAsciiString.hxx>
#include <TDocStd_Document.hxx>
#include <XSControl_WorkSession.hxx>

#include <filesystem>
#include <mutex>
#include <string_view>

namespace VizBridgeStep {

namespace {

/// How many of the entities that failed to read the notes name one by one.
constexpr int kReportedChecks = 5;

/// Open CASCADE's reader keeps process-wide settings and prints to standard output: one read
/// at a time, and its printers are taken away while it runs.
std::mutex& readerLock() {
    static std::mutex lock;
    return lock;
}

class SilentMessenger {
public:
    SilentMessenger() : m_messenger(Message::DefaultMessenger()) {
        for (Message_SequenceOfPrinters::Iterator it(m_messenger->Printers()); it.More(); it.Next())
            m_printers.Append(it.Value());
        m_messenger->ChangePrinters().Clear();
    }
    ~SilentMessenger() {
        for (Message_SequenceOfPrinters::Iterator it(m_printers); it.More(); it.Next())
            m_messenger->AddPrinter(it.Value());
    }
    SilentMessenger(SilentMessenger const&) = delete;
    SilentMessenger& operator=(SilentMessenger const&) = delete;

private:
    Handle(Message_Messenger) m_messenger;
    Message_SequenceOfPrinters m_printers;
};

std::optional<VizPort::WString> present(Handle(TCollection_HAsciiString) const& text) {
    if (text.IsNull() || text->Length() == 0)
        return std::nullopt;
    return Wide(text);
}

std::optional<VizPort::WString> joined(Handle(Interface_HArray1OfHAsciiString) const& texts) {
    if (texts.IsNull())
        return std::nullopt;
    VizPort::WString out;
    for (int i = texts->Lower(); i <= texts->Upper(); ++i) {
        VizPort::WString const one = Wide(texts->Value(i));
        if (one.empty())
            continue;
        out += (out.empty() ? u"" : u"; ") + one;
    }
    return out.empty() ? std::nullopt : std::optional<VizPort::WString>(out);
}

/// Whether `entity` is geometry or topology that the shape transfer builds on.
bool isShapeEntity(Standard_Transient const& entity) {
    std::string_view const type = entity.DynamicType()->Name();
    return type.rfind("StepGeom_", 0) == 0 || type.rfind("StepShape_", 0) == 0;
}

/// "#<label>" of an entity of `model`. Appended, not added: GCC 12 warns wrongly about
/// `"#" + std::string` in optimised builds.
std::string labelOf(StepData_StepModel const& model, Handle(Standard_Transient) const& entity) {
    std::string label = "#";
    label += std::to_string(model.IdentLabel(entity));
    return label;
}

/// The style entities that Open CASCADE's colour reading follows without looking for a field
/// that could not be read.
bool isColourStyleEntity(Standard_Transient const& entity) {
    return entity.IsKind(STANDARD_TYPE(StepVisual_SurfaceStyleUsage)) ||
           entity.IsKind(STANDARD_TYPE(StepVisual_FillAreaStyle));
}

struct UnitName {
    char const* stepName;
    TarvexLengthUnitType unit;
    char16_t const* text;
};

constexpr UnitName kUnits[] = {
    {"MILLIMETRE", TarvexLengthUnit_Millimeter, u"mm"},
    {"METRE", TarvexLengthUnit_Meter, u"m"},
    {"CENTIMETRE", TarvexLengthUnit_Centimeter, u"cm"},
    {"KILOMETRE", TarvexLengthUnit_Kilometer, u"km"},
    {"MICROMETRE", TarvexLengthUnit_Micrometer, u"um"},
    {"INCH", TarvexLengthUnit_Inch, u"in"},
    {"FOOT", TarvexLengthUnit_Foot, u"ft"},
    {"MILE", TarvexLengthUnit_Mile, u"mi"},
    {"YARD", TarvexLengthUnit_Yard, u"yd"},
};

} // namespace

StepDocument::~StepDocument() = default;

StepPart const* StepDocument::FindPart(unsigned int referenceId) const {
    for (StepPart const& part : m_parts)
        if (part.referenceId == referenceId)
            return &part;
    return nullptr;
}

std::shared_ptr<StepDocument> StepDocument::Read(std::string const& path,
                                                 StepReadOptions const& options) {
    std::shared_ptr<StepDocument> document(new StepDocument()); // private constructor
    document->m_schema = StepFileCheck::Check(path);

    std::lock_guard<std::mutex> const lock(readerLock());
    SilentMessenger const silent;
    try {
        document->readLocked(path, options);
    } catch (Standard_Failure const& failure) {
        // Open CASCADE's own exceptions are no std::exception: a host sees them as a file
        // that cannot be read, with what Open CASCADE said.
        throw StepReadError(path + ": Open CASCADE failed reading it (" +
                            failure.DynamicType()->Name() + ": " + failure.GetMessageString() +
                            ")");
    }
    return document;
}

void StepDocument::readLocked(std::string const& path, StepReadOptions const& options) {
    XcafDocument const document;
    Handle(TDocStd_Document) xcaf = document.Get();
    STEPCAFControl_Reader reader;
    reader.SetColorMode(true);
    reader.SetNameMode(true);
    reader.SetLayerMode(true);
    reader.SetGDTMode(true);
    reader.SetViewMode(true);
    // Validation properties (volumes, areas, centroids) are no business of the model, and
    // Open CASCADE 7.6 crashes reading them from a file whose references dangle.
    reader.SetPropsMode(false);
    if (reader.ReadFile(path.c_str()) != IFSelect_RetDone)
        throw StepReadError(path + ": the file could not be parsed as STEP");
    Handle(StepData_StepModel) const model =
        Handle(StepData_StepModel)::DownCast(reader.ChangeReader().WS()->Model());
    if (model.IsNull() || model->NbEntities() == 0)
        throw StepReadError(path + ": the file holds no entity");
    StepUnboundItems unbound(path, model);
    // Entities the reader could not take (a reference to an entity the file lacks, a wrong
    // parameter) are left out of the transfer: say so, and the first few.
    Interface_CheckIterator const checks = reader.ChangeReader().WS()->ModelCheckList();
    int failed = 0;
    std::string brokenStyle;
    for (checks.Start(); checks.More(); checks.Next()) {
        Handle(Interface_Check) const& check = checks.Value();
        if (!check->HasFailed())
            continue;
        // Open CASCADE's shape transfer follows the fields of geometry and topology entities
        // unchecked: one that could not be read crashes it. Such a file is refused.
        if (!check->Entity().IsNull() && isShapeEntity(*check->Entity()))
            throw StepReadError(path + ": its geometry is broken at " +
                                labelOf(*model, check->Entity()) + " (" + check->CFail(1) + ")");
        // Likewise its colour reading with styles: the file is read without colours.
        if (brokenStyle.empty() && !check->Entity().IsNull() &&
            isColourStyleEntity(*check->Entity()))
            brokenStyle = labelOf(*model, check->Entity());
        if (++failed > kReportedChecks)
            continue;
        std::string const where =
            check->Entity().IsNull() ? std::string("the file") : labelOf(*model, check->Entity());
        m_notes.push_back(where + ": " + check->CFail(1));
    }
    if (failed > kReportedChecks)
        m_notes.push_back(std::to_string(failed - kReportedChecks) +
                          " more entities could not be read");
    if (!brokenStyle.empty()) {
        reader.SetColorMode(false);
        m_notes.push_back("colours are not read: the style " + brokenStyle + " is broken");
    }
    if (!reader.Transfer(xcaf))
        throw StepReadError(path + ": no shape could be transferred from the file");

    TarvexAuthoredDocument& strings = m_model.Document();
    strings.formatType = VizPort::Widen(m_schema);
    if (model->HasHeaderEntity(STANDARD_TYPE(HeaderSection_FileName))) {
        Handle(HeaderSection_FileName) const name = Handle(HeaderSection_FileName)::DownCast(
            model->HeaderEntity(STANDARD_TYPE(HeaderSection_FileName)));
        strings.fileName = present(name->Name());
        strings.author = joined(name->Author());
        strings.organization = joined(name->Organization());
        strings.version = present(name->PreprocessorVersion());
        strings.sourceSystem = present(name->OriginatingSystem());
    }
    if (model->HasHeaderEntity(STANDARD_TYPE(HeaderSection_FileDescription))) {
        Handle(HeaderSection_FileDescription) const description =
            Handle(HeaderSection_FileDescription)::DownCast(
                model->HeaderEntity(STANDARD_TYPE(HeaderSection_FileDescription)));
        strings.comment = joined(description->Description());
    }
    TColStd_SequenceOfAsciiString lengths, angles, solidAngles;
    reader.ChangeReader().FileUnits(lengths, angles, solidAngles);
    if (!lengths.IsEmpty()) {
        TCollection_AsciiString name = lengths.First();
        name.UpperCase();
        std::string const unit = name.ToCString();
        bool known = false;
        for (UnitName const& candidate : kUnits) {
            if (unit == candidate.stepName) {
                m_model.SetUnits(candidate.unit);
                strings.unit = VizPort::WString(candidate.text);
                known = true;
            }
        }
        if (!known)
            m_notes.push_back("length unit " + unit + " is not one the model knows");
    }

    StepStructureReader structure(xcaf, m_model, m_parts, m_counts, m_notes);
    structure.Read(VizPort::Widen(std::filesystem::path(path).stem().string()));
    if (m_parts.empty())
        throw StepReadError(path + ": the file holds no part with geometry");
    for (StepPart const& part : m_parts) {
        TarvexAuthoredReference* const reference = m_model.FindReference(part.referenceId);
        m_counts.triangles += StepPartMesher::Mesh(part, options, *reference);
    }
    StepGdtReferences::Check(xcaf, m_parts, m_counts, m_notes);
    // The PMI links the parts' faces, and the views list the PMI: in that order, after the
    // meshes. Both read the entities that the reader keeps in its work session.
    Handle(XSControl_WorkSession) const session = reader.ChangeReader().WS();
    StepAnnotationReader annotations(session, unbound, m_parts, m_model, m_counts, m_notes);
    annotations.Read();
    StepViewReader(session, annotations, m_parts, m_model, m_counts, m_notes).Read();
}

} // namespace VizBridgeStep

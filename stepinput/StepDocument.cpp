#include <VizBridge/stepinput/StepDocument.h>

#include <VizBridge/stepinput/StepFileCheck.h>
#include <VizBridge/stepinput/StepPartMesher.h>
#include <VizBridge/stepinput/StepReadError.h>
#include <VizBridge/stepinput/StepStructureReader.h>
#include <VizBridge/stepinput/StepText.h>

#include <HeaderSection_FileDescription.hxx>
#include <HeaderSection_FileName.hxx>
#include <Message.hxx>
#include <Message_Messenger.hxx>
#include <Message_PrinterOStream.hxx>
#include <STEPCAFControl_Reader.hxx>
#include <STEPControl_Controller.hxx>
#include <StepData_StepModel.hxx>
#include <TColStd_SequenceOfAsciiString.hxx>
#include <TDocStd_Document.hxx>
#include <XCAFApp_Application.hxx>
#include <XSControl_WorkSession.hxx>

#include <filesystem>
#include <mutex>

namespace VizBridgeStep {

namespace {

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
    STEPControl_Controller::Init();
    Handle(TDocStd_Document) xcaf;
    XCAFApp_Application::GetApplication()->NewDocument("MDTV-XCAF", xcaf);
    STEPCAFControl_Reader reader;
    reader.SetColorMode(true);
    reader.SetNameMode(true);
    reader.SetLayerMode(true);
    reader.SetGDTMode(true);
    reader.SetViewMode(true);
    if (reader.ReadFile(path.c_str()) != IFSelect_RetDone)
        throw StepReadError(path + ": the file could not be parsed as STEP");
    Handle(StepData_StepModel) const model =
        Handle(StepData_StepModel)::DownCast(reader.ChangeReader().WS()->Model());
    if (model.IsNull() || model->NbEntities() == 0)
        throw StepReadError(path + ": the file holds no entity");
    if (!reader.Transfer(xcaf))
        throw StepReadError(path + ": no shape could be transferred from the file");

    TarvexAuthoredDocument& strings = document->m_model.Document();
    strings.formatType = VizPort::Widen(document->m_schema);
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
                document->m_model.SetUnits(candidate.unit);
                strings.unit = VizPort::WString(candidate.text);
                known = true;
            }
        }
        if (!known)
            document->m_notes.push_back("length unit " + unit + " is not one the model knows");
    }

    StepStructureReader structure(xcaf, document->m_model, document->m_parts, document->m_counts,
                                  document->m_notes);
    structure.Read(VizPort::Widen(std::filesystem::path(path).stem().string()));
    if (document->m_parts.empty())
        throw StepReadError(path + ": the file holds no part with geometry");
    for (StepPart const& part : document->m_parts) {
        TarvexAuthoredReference* const reference =
            document->m_model.FindReference(part.referenceId);
        document->m_counts.triangles += StepPartMesher::Mesh(part, options, *reference);
    }
    return document;
}

} // namespace VizBridgeStep

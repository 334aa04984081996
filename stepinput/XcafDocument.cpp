#include <VizBridge/stepinput/XcafDocument.h>

#include <VizBridge/stepinput/LeakCheckPause.h>

#include <STEPCAFControl_Controller.hxx>
#include <STEPControl_Controller.hxx>
#include <TDF_Label.hxx>
#include <TPrsStd_DriverTable.hxx>
#include <XCAFApp_Application.hxx>

#include <mutex>

namespace VizBridgeStep {

namespace {

void setUpProcess() {
    static std::once_flag once;
    std::call_once(once, [] {
        LeakCheckPause const pause;
        STEPControl_Controller::Init();
        STEPCAFControl_Controller::Init();
        XCAFApp_Application::GetApplication();
        TPrsStd_DriverTable::Get();
    });
}

} // namespace

XcafDocument::XcafDocument() {
    setUpProcess();
    XCAFApp_Application::GetApplication()->NewDocument("MDTV-XCAF", m_document);
}

XcafDocument::~XcafDocument() {
    // Forgetting an attribute unlinks it from the others first.
    m_document->Main().Root().ForgetAllAttributes(true);
    if (m_document->IsOpened())
        XCAFApp_Application::GetApplication()->Close(m_document);
}

} // namespace VizBridgeStep

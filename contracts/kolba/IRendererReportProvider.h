#pragma once

#include <VizBridge/contracts/platform/WString.h>

namespace KolbaVizCore {

/// The report of a renderer: while report mode is on, a renderer writes a line of text for
/// what it did, which a host reads and clears. Objects are not deleted through this
/// interface.
class IRendererReportProvider {
public:
    virtual void SetReportMode(bool const& on) = 0;
    virtual bool GetReportMode() const = 0;
    virtual void ClearReport() = 0;
    virtual VizPort::WString GetReport() const = 0;

protected:
    IRendererReportProvider() = default;
    IRendererReportProvider(IRendererReportProvider const&) = default;
    IRendererReportProvider& operator=(IRendererReportProvider const&) = default;
    ~IRendererReportProvider() = default;
};

} // namespace KolbaVizCore

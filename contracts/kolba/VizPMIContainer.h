#pragma once

#include "contracts/kolba/AVizContainer.h"
#include "contracts/kolba/SemanticPMI.h"

#include <map>
#include <memory>

namespace KolbaVizCore {

/// PMI of one reference and the semantic records of its PMI objects, which it owns.
class VizPMIContainer : public AVizContainer {
public:
    explicit VizPMIContainer(int const& refId) : AVizContainer(refId) {}
    // Owns its records: a copy would free them twice.
    VizPMIContainer(VizPMIContainer const&) = delete;
    VizPMIContainer& operator=(VizPMIContainer const&) = delete;

    std::string GetTypeName() const override { return "VizPMIContainer"; }

    bool HasSemanticPMI() const { return !m_semanticPMI.empty(); }
    /// Takes ownership of `record`, filed under its ID. A record with the same ID that
    /// was there before is freed. A null record is ignored.
    void AddSemanticPMI(SemanticPMI* record);
    /// True and the record (still the container's) if one is filed under `key`;
    /// otherwise false and `out` untouched.
    bool GetSemanticPMI(VizPort::WString const& key, SemanticPMI*& out) const;
    /// True and SemanticPMI::ToString of the record under `key`; otherwise false and
    /// `text` untouched.
    bool GetSemanticPMIAsString(VizPort::WString const& key, VizPort::WString& text) const;
    int GetNumberOfSemanticPMI() const { return static_cast<int>(m_semanticPMI.size()); }

private:
    std::map<VizPort::WString, std::unique_ptr<SemanticPMI>> m_semanticPMI;
};

} // namespace KolbaVizCore

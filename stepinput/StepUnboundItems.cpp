#include <VizBridge/stepinput/StepUnboundItems.h>

#include <Interface_UndefinedContent.hxx>
#include <Standard_Macro.hxx>
#include <Standard_TypeDef.hxx>
#include <StepData_Protocol.hxx>
#include <StepData_UndefinedEntity.hxx>
#include <StepFile_Read.hxx>
#include <StepVisual_TessellatedAnnotationOccurrence.hxx>

#include <cstring>
#include <set>
#include <utility>

namespace VizBridgeStep {

namespace {

constexpr char kOccurrence[] = "TESSELLATED_ANNOTATION_OCCURRENCE";

bool needsItems(StepData_StepModel const& typed) {
    for (int i = 1; i <= typed.NbEntities(); ++i) {
        auto const occurrence =
            Handle(StepVisual_TessellatedAnnotationOccurrence)::DownCast(typed.Value(i));
        if (!occurrence.IsNull() && occurrence->Item().IsNull())
            return true;
    }
    return false;
}

/// Drops every reference between the records of a model when it goes. A broken file can reference
/// in a circle, and handles in a circle never free each other; each entity parameter is pointed at
/// one shared placeholder instead (Open CASCADE refuses a null one), on every part of a
/// complex record too. Sub-lists hang off one record each, so they go with it.
class Unbinder {
public:
    explicit Unbinder(Handle(StepData_StepModel) model) : m_model(std::move(model)) {}
    Unbinder(Unbinder const&) = delete;
    Unbinder& operator=(Unbinder const&) = delete;
    ~Unbinder() {
        try {
            Handle(Standard_Transient) const placeholder = new Standard_Transient;
            for (int i = 1; i <= m_model->NbEntities(); ++i)
                for (auto part = Handle(StepData_UndefinedEntity)::DownCast(m_model->Value(i));
                     !part.IsNull(); part = part->Next()) {
                    Handle(Interface_UndefinedContent) const content = part->UndefinedContent();
                    for (int param = 1; !content.IsNull() && param <= content->NbParams(); ++param)
                        if (content->IsParamEntity(param))
                            content->SetEntity(param, placeholder);
                }
        } catch (...) {
            // Whatever could not be unbound stays allocated; a destructor does not throw.
        }
    }

private:
    Handle(StepData_StepModel) m_model;
};

/// Reads every record of `path` as an unread entity: a protocol that knows no type leaves
/// each record's parameters as the file gives them, references bound to entities.
std::map<int, int> readLabels(std::string const& path) {
    Handle(StepData_StepModel) const model = new StepData_StepModel;
    Unbinder const unbinder(model);
    std::map<int, int> labels;
    if (StepFile_Read(path.c_str(), nullptr, model, new StepData_Protocol) != 0)
        return labels;
    for (int i = 1; i <= model->NbEntities(); ++i) {
        auto const record = Handle(StepData_UndefinedEntity)::DownCast(model->Value(i));
        // "#<label> = TESSELLATED_ANNOTATION_OCCURRENCE(name, styles, item)"
        if (record.IsNull() || record->IsComplex() ||
            std::strcmp(record->StepType(), kOccurrence) != 0)
            continue;
        Handle(Interface_UndefinedContent) const content = record->UndefinedContent();
        if (content->NbParams() >= 3 && content->IsParamEntity(3))
            labels[model->IdentLabel(record)] = model->IdentLabel(content->ParamEntity(3));
    }
    return labels;
}

} // namespace

StepUnboundItems::StepUnboundItems(std::string path, Handle(StepData_StepModel) const& typed)
    : m_typed(typed) {
    if (!m_typed.IsNull() && needsItems(*m_typed))
        m_reading = std::async(std::launch::async, [path = std::move(path)] {
            try {
                return readLabels(path);
            } catch (...) {
                // Open CASCADE's own failures and any other: the occurrences stay unbound,
                // which the caller reports.
                return Labels{};
            }
        });
}

StepUnboundItems::~StepUnboundItems() {
    if (m_reading.valid())
        m_reading.wait();
}

Handle(Standard_Transient) StepUnboundItems::ItemOf(Handle(Standard_Transient) const& occurrence) {
    if (!m_items) {
        m_items.emplace();
        if (m_reading.valid()) {
            Labels const labels = m_reading.get();
            std::set<int> itemLabels;
            for (auto const& [occurrenceLabel, itemLabel] : labels)
                itemLabels.insert(itemLabel);
            std::map<int, Handle(Standard_Transient)> byLabel;
            for (int i = 1; i <= m_typed->NbEntities(); ++i)
                if (itemLabels.count(m_typed->IdentLabel(m_typed->Value(i))) > 0)
                    byLabel[m_typed->IdentLabel(m_typed->Value(i))] = m_typed->Value(i);
            for (auto const& [occurrenceLabel, itemLabel] : labels)
                (*m_items)[occurrenceLabel] = byLabel[itemLabel];
        }
    }
    auto const found = m_items->find(m_typed->IdentLabel(occurrence));
    return found == m_items->end() ? nullptr : found->second;
}

} // namespace VizBridgeStep

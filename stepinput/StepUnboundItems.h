#pragma once

#include <Standard_Handle.hxx>
#include <Standard_Transient.hxx>
#include <StepData_StepModel.hxx>

#include <future>
#include <map>
#include <optional>
#include <string>

namespace VizBridgeStep {

/// The items of the tessellated annotation occurrences that Open CASCADE 7.6 reads but cannot
/// bind. An occurrence's item is most often a complex entity that 7.6 does not know (a
/// repositioned tessellated set): the reader keeps it as an unread entity of the model but
/// hands it to the occurrence where no accessor returns it.
///
/// The file's records are read a second time, untyped, through Open CASCADE's own STEP layer;
/// that read runs on a thread of its own while the caller transfers and meshes, and only
/// when the typed model holds such an occurrence.
///
/// Shares the typed model. Waits for its read when destroyed.
class StepUnboundItems {
public:
    /// Starts reading `path` again when `typed`, the model that read it, needs it.
    StepUnboundItems(std::string path, Handle(StepData_StepModel) const& typed);
    StepUnboundItems(StepUnboundItems const&) = delete;
    StepUnboundItems& operator=(StepUnboundItems const&) = delete;
    ~StepUnboundItems();

    /// The entity of the typed model that is the item of `occurrence`, or null. Waits for the
    /// second read the first time; a second read that fails binds nothing.
    Handle(Standard_Transient) ItemOf(Handle(Standard_Transient) const& occurrence);

private:
    /// Item label by occurrence label, as the untyped read of the file gives them.
    using Labels = std::map<int, int>;

    Handle(StepData_StepModel) m_typed;
    std::future<Labels> m_reading;
    /// The typed model's items by occurrence label, made when the labels arrive.
    std::optional<std::map<int, Handle(Standard_Transient)>> m_items;
};

} // namespace VizBridgeStep

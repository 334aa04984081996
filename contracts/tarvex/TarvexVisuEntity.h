#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>
#include <optional>

class TarvexModelData;

/// An entity of a part as its visualisation data shows it: the visual id of the face, edge
/// or PMI that stands for it. A default object has no id.
class TarvexVisuEntity {
public:
    TarvexVisuEntity() = default;
    TarvexVisuEntity(std::shared_ptr<TarvexModelData const> data,
                     std::optional<VizPort::WString> id)
        : m_data(std::move(data)), m_id(std::move(id)) {}

    bool GetID(TarvexWString& id) const;

private:
    std::shared_ptr<TarvexModelData const> m_data; ///< only for its fault plan
    std::optional<VizPort::WString> m_id;
};

#pragma once

#include <VizBridge/contracts/tarvex/TarvexEntity.h>

#include <memory>
#include <vector>

class TarvexModelData;

/// A PMI annotation. This stand-in knows the elements it is linked to.
class TarvexPMIAnnotation {
public:
    TarvexPMIAnnotation() = default;
    TarvexPMIAnnotation(std::shared_ptr<TarvexModelData const> data,
                        std::vector<TarvexEntity> linkedElements)
        : m_data(std::move(data)), m_linked(std::move(linkedElements)) {}

    int GetLinkedElementsCount() const;
    /// Fills `entity` with linked element `index` (from 0); leaves it alone out of range.
    void GetLinkedElement(int index, TarvexEntity& entity) const;

private:
    std::shared_ptr<TarvexModelData const> m_data;
    std::vector<TarvexEntity> m_linked;
};

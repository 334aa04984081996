#pragma once

#include <memory>

class TarvexModelData;

/// Where a value object of the visualisation data comes from: the model whose fault plan its
/// operations ask, and the subject they ask it for, the unique id of the reference whose data
/// it belongs to. Shares the model, so that the entities it hands out can still reach it.
/// A default context has no model: nothing is planned for it, and nothing throws.
class TarvexVisuContext {
public:
    TarvexVisuContext() = default;
    TarvexVisuContext(std::shared_ptr<TarvexModelData const> model, unsigned int subject)
        : m_model(std::move(model)), m_subject(subject) {}

    /// Throws if the model's plan has a fault due for `operation` on this subject.
    void Check(char const* operation) const;

    /// Checks `operation` and gives the record a value object reads, null for a default one.
    template <class Record>
    Record const* Read(std::shared_ptr<Record const> const& record, char const* operation) const {
        Check(operation);
        return record.get();
    }

    std::shared_ptr<TarvexModelData const> const& Model() const { return m_model; }
    unsigned int Subject() const { return m_subject; }

private:
    std::shared_ptr<TarvexModelData const> m_model;
    unsigned int m_subject = 0;
};

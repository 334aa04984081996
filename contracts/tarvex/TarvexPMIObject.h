#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

struct TarvexAuthoredPMIObject;

/// What every PMI object answers: its name, its id and whether it is hidden. A value object
/// that shares its record with the model it came from; a default object is an object without
/// name or id. Each operation asks the context's fault plan first, as "Class::Operation".
class TarvexPMIObject {
public:
    TarvexPMIObject() = default;
    TarvexPMIObject(TarvexVisuContext context,
                    std::shared_ptr<TarvexAuthoredPMIObject const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}
    virtual ~TarvexPMIObject() = default;
    TarvexPMIObject(TarvexPMIObject const&) = default;
    TarvexPMIObject& operator=(TarvexPMIObject const&) = default;

    TarvexWString GetName() const;
    TarvexWString GetID() const;
    bool IsHidden() const;

protected:
    /// Checks `operation` and gives the record as the class it was made with, null for a
    /// default object. Each derived class is only ever made with its own record class.
    template <class Record> Record const* read(char const* operation) const {
        m_context.Check(operation);
        return static_cast<Record const*>(m_record.get());
    }
    TarvexVisuContext const& context() const { return m_context; }
    /// A part of the record, kept alive by the whole record: for the lists that iterators
    /// walk and the records of the objects this one holds.
    template <class Part> std::shared_ptr<Part const> share(Part const& part) const {
        return std::shared_ptr<Part const>(m_record, &part);
    }

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredPMIObject const> m_record;
};

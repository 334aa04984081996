#pragma once

#include <VizBridge/contracts/kolba/SemanticPMI.h>
#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexPMIObject.h>

namespace VizBridgeTarvex {

using KolbaVizCore::SemanticPMI;
using VizPort::WString;

/// Reads one PMI object of the import library and writes what it finds as text into one
/// semantic record: the name, the id and "Hidden" here, the keys of the object's class in
/// LoadSemantics. Points at the object and the record and owns neither: both must outlive
/// the loader, which lives on its caller's stack for one Load() (hence no virtual destructor).
///
/// A write enters a key or replaces its value, and nothing is ever removed, so two loaders
/// can run on one record one after the other. An exception (from a vocabulary under the
/// throw switch, or from the import library) leaves the record with the keys written so far.
class AVizSemanticPMILoader {
public:
    AVizSemanticPMILoader(AVizSemanticPMILoader const&) = delete;
    AVizSemanticPMILoader& operator=(AVizSemanticPMILoader const&) = delete;

    /// Name, ID and "Hidden" from the object, then the keys of its class.
    virtual void Load();

protected:
    AVizSemanticPMILoader(TarvexPMIObject& object, SemanticPMI& record)
        : m_record(&record), m_object(&object) {}
    ~AVizSemanticPMILoader() = default;

    virtual void LoadSemantics() = 0;

    /// Enters `key` with `value`, or replaces the value that is there.
    void write(WString const& key, WString value) { m_record->Properties[key] = std::move(value); }
    /// The object as the class that each loader was made with.
    template <class Object> Object& object() const { return static_cast<Object&>(*m_object); }

    SemanticPMI* m_record;     ///< not owned
    TarvexPMIObject* m_object; ///< not owned
};

} // namespace VizBridgeTarvex

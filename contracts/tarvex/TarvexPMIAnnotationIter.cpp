#include <VizBridge/contracts/tarvex/TarvexPMIAnnotationIter.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDatum.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDatumTarget.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDimension.h>
#include <VizBridge/contracts/tarvex/TarvexPMIGDT.h>
#include <VizBridge/contracts/tarvex/TarvexPMINote.h>
#include <VizBridge/contracts/tarvex/TarvexPMIRoughness.h>

namespace {

template <class Object, class Record>
bool makeAs(TarvexVisuContext const& context,
            std::shared_ptr<TarvexAuthoredPMIAnnotation const> const& record,
            std::unique_ptr<TarvexPMIAnnotation>& object) {
    if (auto typed = std::dynamic_pointer_cast<Record const>(record)) {
        object = std::make_unique<Object>(context, std::move(typed));
        return true;
    }
    return false;
}

/// The object of the class that `record` was made for, so that what GetObjectType reports and
/// the class behind the reference always agree.
std::unique_ptr<TarvexPMIAnnotation>
makeAnnotation(TarvexVisuContext const& context,
               std::shared_ptr<TarvexAuthoredPMIAnnotation const> const& record) {
    std::unique_ptr<TarvexPMIAnnotation> object;
    if (makeAs<TarvexPMINote, TarvexAuthoredPMINote>(context, record, object) ||
        makeAs<TarvexPMIDatum, TarvexAuthoredPMIDatum>(context, record, object) ||
        makeAs<TarvexPMIDatumTarget, TarvexAuthoredPMIDatumTarget>(context, record, object) ||
        makeAs<TarvexPMIDimension, TarvexAuthoredPMIDimension>(context, record, object) ||
        makeAs<TarvexPMIGDT, TarvexAuthoredPMIGDT>(context, record, object) ||
        makeAs<TarvexPMIRoughness, TarvexAuthoredPMIRoughness>(context, record, object)) {
        return object;
    }
    return std::make_unique<TarvexPMIAnnotation>(context, record);
}

} // namespace

TarvexPMIAnnotationIter::TarvexPMIAnnotationIter() = default;

TarvexPMIAnnotationIter::TarvexPMIAnnotationIter(TarvexVisuContext context,
                                                 std::shared_ptr<Records const> records)
    : m_context(std::move(context)), m_records(std::move(records)) {}

TarvexPMIAnnotationIter::~TarvexPMIAnnotationIter() = default;

// A copy walks on from the same place; it makes its own current object when asked.
TarvexPMIAnnotationIter::TarvexPMIAnnotationIter(TarvexPMIAnnotationIter const& other)
    : m_context(other.m_context), m_records(other.m_records), m_position(other.m_position) {}

TarvexPMIAnnotationIter& TarvexPMIAnnotationIter::operator=(TarvexPMIAnnotationIter const& other) {
    if (this != &other) {
        m_context = other.m_context;
        m_records = other.m_records;
        m_position = other.m_position;
        m_current.reset();
        m_currentPosition = -2;
    }
    return *this;
}

int TarvexPMIAnnotationIter::GetCount() const {
    m_context.Check("TarvexPMIAnnotationIter::GetCount");
    return size();
}

bool TarvexPMIAnnotationIter::Next() {
    m_context.Check("TarvexPMIAnnotationIter::Next");
    if (m_position < size()) {
        ++m_position;
    }
    return m_position < size();
}

TarvexPMIAnnotation& TarvexPMIAnnotationIter::Current() {
    m_context.Check("TarvexPMIAnnotationIter::Current");
    if (m_current && m_currentPosition == m_position) {
        return *m_current;
    }
    m_currentPosition = m_position;
    if (m_position < 0 || m_position >= size()) {
        m_current = std::make_unique<TarvexPMIAnnotation>();
    } else {
        m_current = makeAnnotation(m_context, (*m_records)[static_cast<std::size_t>(m_position)]);
    }
    return *m_current;
}

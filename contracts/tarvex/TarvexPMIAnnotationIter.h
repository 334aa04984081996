#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>
#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>

#include <memory>
#include <vector>

struct TarvexAuthoredPMIAnnotation;

/// The annotations of a view or capture, each handed out as the class it reports through
/// GetObjectType. Current() gives a reference to an object that the iterator owns and that
/// stays valid until the next Next(), the next assignment or the iterator's end; before the first
/// Next() or past the end it is an empty annotation.
class TarvexPMIAnnotationIter {
public:
    using Records = std::vector<std::shared_ptr<TarvexAuthoredPMIAnnotation const>>;

    TarvexPMIAnnotationIter();
    TarvexPMIAnnotationIter(TarvexVisuContext context, std::shared_ptr<Records const> records);
    ~TarvexPMIAnnotationIter();
    TarvexPMIAnnotationIter(TarvexPMIAnnotationIter const& other);
    TarvexPMIAnnotationIter& operator=(TarvexPMIAnnotationIter const& other);

    int GetCount() const;
    bool Next();
    TarvexPMIAnnotation& Current();

private:
    int size() const { return m_records ? static_cast<int>(m_records->size()) : 0; }

    TarvexVisuContext m_context;
    std::shared_ptr<Records const> m_records; ///< shares the view's or capture's record
    int m_position = -1;
    std::unique_ptr<TarvexPMIAnnotation> m_current; ///< owned; made by Current()
    int m_currentPosition = -2;                     ///< the position m_current was made for
};

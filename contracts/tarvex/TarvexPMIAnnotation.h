#pragma once

#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexPMIObject.h>
#include <VizBridge/contracts/tarvex/TarvexPMITypes.h>

#include <memory>

class TarvexPMILeaderIter;
struct TarvexAuthoredPMIAnnotation;

/// A PMI annotation: where it stands, its leaders and the elements it is linked to. The
/// classes derived from it (note, datum, datum target, dimension, GDT, roughness) report
/// themselves through GetObjectType, and an annotation handed out as TarvexPMIAnnotation& is
/// of the class that it reports.
class TarvexPMIAnnotation : public TarvexPMIObject {
public:
    TarvexPMIAnnotation() = default;
    TarvexPMIAnnotation(TarvexVisuContext context,
                        std::shared_ptr<TarvexAuthoredPMIAnnotation const> record);

    /// The annotation's class. A plain annotation reports only a class that has no object
    /// of its own: 0, or what its record says when that is above 8.
    virtual TarvexPMIAnnotationType GetObjectType() const;

    /// True and position (two floats), orientation, angle and Z depth filled when the
    /// annotation is placed; the arguments are left alone when it is not.
    bool GetPositioning(float* const position, TarvexPMIOrientation& orientation, float& angle,
                        float& zDepth) const;
    TarvexPMILeaderIter GetLeaderIterator() const;

    int GetLinkedElementsCount() const;
    /// Fills `entity` with linked element `index` (from 0); leaves it alone out of range.
    void GetLinkedElement(int index, TarvexEntity& entity) const;
};

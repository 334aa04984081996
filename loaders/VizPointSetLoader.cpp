#include <VizBridge/loaders/VizPointSetLoader.h>

#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizPoints.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPointsIter.h>
#include <VizBridge/loaders/HandOver.h>
#include <VizBridge/loaders/LoadAs.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/loaders/VizPointsLoader.h>

namespace VizBridgeTarvex {

using KolbaVizCore::VizPoints;
using KolbaVizCore::VizPointSet;

VizPointSetLoader::VizPointSetLoader(TarvexVisuPointSet const& source,
                                     std::vector<TarvexVisuAttributes>* attributes,
                                     bool const& inheritAttributes)
    : VizSourceLoader(source, attributes, inheritAttributes) {}

KolbaVizCore::VizElement* VizPointSetLoader::loadOne() {
    auto* const pointSet = dynamic_cast<VizPointSet*>(makeOne());
    if (pointSet == nullptr)
        return nullptr;

    TarvexVisuPointsIter groups = m_source->GetPointsIterator();
    int const count = groups.GetCount();
    pointSet->SetPointsCountHint(countHint(count));
    while (groups.Next()) {
        TarvexVisuPoints const source = groups.Current();
        // The set carries no colour of its own here, so its points always look up the stack.
        VizPointsLoader loader(source, m_attributes, true);
        handOver(loadAs<VizPoints>(loader),
                 [pointSet](VizPoints* const points) { pointSet->AddPoints(points); });
    }
    return pointSet;
}

} // namespace VizBridgeTarvex

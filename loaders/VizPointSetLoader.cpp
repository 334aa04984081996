#include "loaders/VizPointSetLoader.h"

#include "contracts/kolba/VizPointSet.h"
#include "contracts/kolba/VizPoints.h"
#include "contracts/tarvex/TarvexVisuPointsIter.h"
#include "loaders/LoadAs.h"
#include "loaders/VizPointsLoader.h"

namespace VizBridgeTarvex {

using KolbaVizCore::VizPoints;
using KolbaVizCore::VizPointSet;

VizPointSetLoader::VizPointSetLoader(TarvexVisuPointSet const& source,
                                     std::vector<TarvexVisuAttributes>* attributes,
                                     bool const& inheritAttributes)
    : m_inheritAttributes(inheritAttributes), m_attributes(attributes), m_source(&source) {}

KolbaVizCore::VizElement* VizPointSetLoader::loadOne() {
    auto* const pointSet = dynamic_cast<VizPointSet*>(makeOne());
    if (pointSet == nullptr)
        return nullptr;

    TarvexVisuPointsIter groups = m_source->GetPointsIterator();
    int const count = groups.GetCount();
    pointSet->SetPointsCountHint(count > 0 ? static_cast<unsigned int>(count) : 0u);
    while (groups.Next()) {
        TarvexVisuPoints const source = groups.Current();
        // The set carries no colour of its own here, so its points always look up the stack.
        VizPointsLoader loader(source, m_attributes, true);
        pointSet->AddPoints(loadAs<VizPoints>(loader).release());
    }
    return pointSet;
}

} // namespace VizBridgeTarvex

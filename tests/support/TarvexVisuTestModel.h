#pragma once

#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexVisuData.h>
#include <VizBridge/contracts/tarvex/TarvexVisualizationImporter.h>

#include <vector>

/// The part 20 ("Bracket") below root instance 1, whose visualisation data a test fills
/// through `Visu()` before importing it.
class TarvexVisuTestModel {
public:
    TarvexVisuTestModel() {
        model.AddPart(20, u"Bracket");
        model.AddRootInstance(20, u"Bracket.1");
    }

    TarvexAuthoredVisuData& Visu() { return model.FindReference(20)->visu; }

    TarvexPartDocument Document() const {
        return model.GetInputProductStructure().GetReferenceFromId(20).GetDocument();
    }

    TarvexVisuData Import() const {
        return TarvexVisualizationImporter().Import(Document()).GetVisualizationData();
    }

    /// The nodes of the imported data, in order.
    std::vector<TarvexVisuNode> Nodes() const {
        std::vector<TarvexVisuNode> nodes;
        TarvexVisuNodeIter iterator = Import().GetNodeIterator();
        while (iterator.Next()) {
            nodes.push_back(iterator.Current());
        }
        return nodes;
    }

    TarvexModel model;
};

/// Every item of an iterator, in order.
template <class Iterator> auto Items(Iterator iterator) {
    std::vector<decltype(iterator.Current())> items;
    while (iterator.Next()) {
        items.push_back(iterator.Current());
    }
    return items;
}

#pragma once

#include <VizBridge/model/VizTypes.h>

namespace VizBridgeTarvex {

/// The document strings of a product. A plain record: a host may fill one itself for the
/// host-data form of VizBuilder::MakeVizProductStructure.
struct VizDocumentInfo {
    WString productName;
    WString formatType;
    WString author;
    WString organization;
    WString version;
    WString documentUnits;
    WString sourceSystem;
    WString comment;
    WString fileName;
};

} // namespace VizBridgeTarvex

#pragma once

#include <VizBridge/model/VizTypes.h>

#include <map>

namespace VizBridgeTarvex {

/// Records of one reference by the id text of their PMI object. Holds its records until
/// they are handed to VizProductStructure::AddSemanticPMI.
using SemanticPMIByKey = std::map<WString, SemanticPMI*>;
/// Record maps by reference id. Local to one import call; its caller deletes each inner map.
using SemanticPMIByReference = std::map<int, SemanticPMIByKey*>;

} // namespace VizBridgeTarvex

#pragma once

#include "SamplePMI.h"

#include <ostream>

class TarvexModel;

namespace VizBridgeExamples {

/// Reads the sample's PMI objects into semantic records, one per object id, through the
/// semantic loader of each object's class, and prints each record's keys and values in the
/// order the record keeps them. Datum targets are read through their datum, with the
/// numbered prefix.
void PrintSemanticRecords(std::ostream& out, TarvexModel const& model, SamplePMI const& pmi);

} // namespace VizBridgeExamples

#pragma once

// The contract types that the system's interface speaks in, named in its own namespace.

#include <VizBridge/contracts/kolba/AVizContainer.h>
#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/kolba/EntityType.h>
#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/kolba/RenderId.h>
#include <VizBridge/contracts/kolba/SemanticPMI.h>
#include <VizBridge/contracts/kolba/VizBox.h>
#include <VizBridge/contracts/kolba/VizContainer.h>
#include <VizBridge/contracts/kolba/VizElement.h>
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/contracts/kolba/VizTransf.h>
#include <VizBridge/contracts/platform/WString.h>

namespace VizBridgeTarvex {

using VizPort::WString;

using KolbaVizCore::AVizContainer;
using KolbaVizCore::EntityId;
using KolbaVizCore::EntityType;
using KolbaVizCore::RenderId;
using KolbaVizCore::RGBAColor;
using KolbaVizCore::SemanticPMI;
using KolbaVizCore::VizBox;
using KolbaVizCore::VizContainer;
using KolbaVizCore::VizElement;
using KolbaVizCore::VizPMIContainer;
using KolbaVizCore::VizTransf;

} // namespace VizBridgeTarvex

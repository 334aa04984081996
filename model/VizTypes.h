#pragma once

// The contract types that the system's interface speaks in, named in its own namespace.

#include "contracts/kolba/AVizContainer.h"
#include "contracts/kolba/EntityId.h"
#include "contracts/kolba/EntityType.h"
#include "contracts/kolba/RGBAColor.h"
#include "contracts/kolba/RenderId.h"
#include "contracts/kolba/SemanticPMI.h"
#include "contracts/kolba/VizBox.h"
#include "contracts/kolba/VizContainer.h"
#include "contracts/kolba/VizElement.h"
#include "contracts/kolba/VizPMIContainer.h"
#include "contracts/kolba/VizTransf.h"
#include "contracts/platform/WString.h"

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

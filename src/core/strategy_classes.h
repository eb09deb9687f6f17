// Registration entries of the three creatable scan-strategy classes.
#pragma once

#include "platform/class_factory.h"

#include <vector>

namespace Norvane::Lumis::Scanning {

// ScanStrategyRaster, ScanStrategyRectangular and ScanStrategyCircular, each free-threaded under its
// class identifier and the ProgID "Beamweaver.<Name>".
std::vector<ClassEntry> StrategyClassEntries();

} // namespace Norvane::Lumis::Scanning

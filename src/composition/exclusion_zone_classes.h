// The creatable class of the exclusion zone, as an entry of the library's class table.
#pragma once

#include "platform/class_factory.h"

#include <vector>

namespace Norvane::Lumis::Scanning {

// The exclusion zone, free-threaded, created by class identifier or ProgID ("Beamweaver.ExclusionZone").
std::vector<ClassEntry> ExclusionZoneClassEntries();

} // namespace Norvane::Lumis::Scanning

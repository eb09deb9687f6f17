// The creatable class of the circle pattern, as an entry of the library's class table.
#pragma once

#include "platform/class_factory.h"

#include <vector>

namespace Norvane::Lumis::Scanning {

// PatternCircle, free-threaded, created by class identifier or ProgID "Beamweaver.PatternCircle".
std::vector<ClassEntry> CircleClassEntries();

} // namespace Norvane::Lumis::Scanning

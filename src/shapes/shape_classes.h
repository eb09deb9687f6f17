// The creatable classes of the shape patterns, as entries of the library's class table.
#pragma once

#include "platform/class_factory.h"

#include <vector>

namespace Norvane::Lumis::Scanning {

// Every shape class, free-threaded, created by class identifier or ProgID ("Beamweaver.PatternLine").
std::vector<ClassEntry> ShapeClassEntries();

} // namespace Norvane::Lumis::Scanning

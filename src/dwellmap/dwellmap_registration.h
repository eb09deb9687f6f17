// Registration of the point-list component's creatable classes: the point list and the sub-pattern
// collection, both free-threaded, created by class identifier or by ProgID ("Dwellmap.PatternPointList").
#pragma once

#include "platform/class_factory.h"

#include <vector>

std::vector<ClassEntry> DwellmapClassEntries();

// Registers the classes; calling it again registers the same entries again.
void RegisterDwellmapClasses();

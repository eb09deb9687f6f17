// The creatable classes of the exclusion shapes, as entries of the library's class table.
#pragma once

#include "platform/class_factory.h"

#include <vector>

namespace Norvane::Lumis::Scanning {

// ShapeRectangle, ShapeCircle and ShapePolygon, free-threaded, created by class identifier or ProgID
// ("Beamweaver.ShapeRectangle").
std::vector<ClassEntry> ExclusionShapeClassEntries();

} // namespace Norvane::Lumis::Scanning

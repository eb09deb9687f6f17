// Class-table entries of the polygon pattern.
#pragma once

#include "platform/class_factory.h"

#include <vector>

namespace Norvane::Lumis::Scanning {

std::vector<ClassEntry> PolygonClassEntries();

} // namespace Norvane::Lumis::Scanning

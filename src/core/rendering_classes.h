// Registration entries of the four creatable rendering-properties and alignment classes.
#pragma once

#include "platform/class_factory.h"

#include <vector>

namespace Norvane::Lumis::Scanning {

// PatternAlignments, RasterAlignments, PatternRenderingProperties and RasterRenderingProperties, each
// free-threaded under its class identifier and the ProgID "Beamweaver.<Name>".
std::vector<ClassEntry> RenderingClassEntries();

} // namespace Norvane::Lumis::Scanning

// Copies a scan definition's sub patterns and values out of the library's objects.
#pragma once

#include "tools/rendered_scan.h"

#include <beamweaver/comtypes.h>
#include <beamweaver/scan_definition.h>

namespace Norvane::Lumis::Scanning::Tool {

// Reads every sub pattern (offsets, repeat count, all point records in one range read per list), the
// collection's dwell time resolution and field of view, and the scan definition's gate-pulse and
// acquisition values. A failed call throws ToolError naming it.
RenderedScan ReadScanDefinition(IScanDefinition& scanDefinition);

DacRectangle ReadRectangle(IRectangleInt& rectangle, const char* step);

} // namespace Norvane::Lumis::Scanning::Tool

// Creation of the render output. Each scan definition takes one reference to the collection and copies
// the values; the caller owns the one reference of the result. Failures are thrown: a null collection
// as std::invalid_argument, a failed creation as the platform's exception.
#pragma once

#include "module/geometry_values.h"
#include "platform/com_ptr.h"

#include <beamweaver/scan_definition.h>

#include <cstdint>

namespace Norvane::Lumis::Scanning {

// The output of every non-raster pattern.
CComPtr<IScanDefinition>
CreatePatternScanDefinition(ISubPatternCollection* collection, ScanSynchronizationSource source,
                            std::uint32_t gatePulseIdleTicks, std::uint32_t acquisitionUpdatePoints,
                            bool allowSubPatternNavigation, bool blankBeamBetweenSubPatterns);

// The output of the rasters; selectedArea is in pixels.
CComPtr<IScanDefinition>
CreateRasterScanDefinition(ISubPatternCollection* collection, ScanSynchronizationSource source,
                           std::uint32_t gatePulseIdleTicks, std::uint32_t acquisitionUpdatePoints,
                           SizeInt imageSize, std::int32_t lineInterlace, std::int32_t scanType,
                           std::int32_t lineScanOrientation, std::int32_t lineScanDirection,
                           std::int32_t frameScanDirection, RectangleInt selectedArea);

} // namespace Norvane::Lumis::Scanning

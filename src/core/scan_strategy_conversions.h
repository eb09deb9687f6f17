// Conversions between the scan-strategy objects and the records patterns hold. Readers go through the
// public interface, so they accept any implementation; a pattern's ScanStrategy setter reads the given
// object once and keeps the copy, never the object. Makers create the library's own objects holding a
// copy of the record, for a pattern's ScanStrategy getter. Failed getters throw their HRESULT with the
// callee's error information; a null object throws std::invalid_argument "ScanStrategy object is null".
#pragma once

#include "core/scan_strategy_values.h"
#include "platform/com_ptr.h"

#include <beamweaver/strategies.h>

namespace Norvane::Lumis::Scanning {

// Reads LineScanOrientation, LineScanDirection, FrameScanDirection, ScanType.
RasterStrategy ReadScanStrategyRaster(IScanStrategyRaster* value);
CComPtr<IScanStrategyRaster> MakeScanStrategyRaster(const RasterStrategy& value);

// Reads LineScanOrientation, LineScanDirection, FrameScanDirection, ScanType, PitchX, PitchY, FillStyle,
// MultiPass.
RectangularStrategy ReadScanStrategyRectangular(IScanStrategyRectangular* value);
CComPtr<IScanStrategyRectangular> MakeScanStrategyRectangular(const RectangularStrategy& value);

// Reads PitchT, PitchR, FillStyle, ScanType, MultiPass.
CircularStrategy ReadScanStrategyCircular(IScanStrategyCircular* value);
CComPtr<IScanStrategyCircular> MakeScanStrategyCircular(const CircularStrategy& value);

} // namespace Norvane::Lumis::Scanning

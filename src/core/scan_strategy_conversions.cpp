#include "core/scan_strategy_conversions.h"

#include "core/scan_strategy_circular.h"
#include "core/scan_strategy_raster.h"
#include "core/scan_strategy_rectangular.h"
#include "module/property_read.h"

#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

void RequireStrategy(const void* value) {
    if (value == nullptr)
        throw std::invalid_argument("ScanStrategy object is null");
}

} // namespace

RasterStrategy ReadScanStrategyRaster(IScanStrategyRaster* value) {
    RequireStrategy(value);
    using I = IScanStrategyRaster;
    RasterStrategy result;
    result.orientation = ReadValue(value, &I::get_LineScanOrientation);
    result.lineDirection = ReadValue(value, &I::get_LineScanDirection);
    result.frameDirection = ReadValue(value, &I::get_FrameScanDirection);
    result.scanType = ReadValue(value, &I::get_ScanType);
    return result;
}

CComPtr<IScanStrategyRaster> MakeScanStrategyRaster(const RasterStrategy& value) {
    return CComObjectEx<CScanStrategyRaster>::CreateInstance<IScanStrategyRaster>(value);
}

RectangularStrategy ReadScanStrategyRectangular(IScanStrategyRectangular* value) {
    RequireStrategy(value);
    using I = IScanStrategyRectangular;
    RectangularStrategy result;
    result.orientation = ReadValue(value, &I::get_LineScanOrientation);
    result.lineDirection = ReadValue(value, &I::get_LineScanDirection);
    result.frameDirection = ReadValue(value, &I::get_FrameScanDirection);
    result.scanType = ReadValue(value, &I::get_ScanType);
    result.pitchX = ReadValue(value, &I::get_PitchX);
    result.pitchY = ReadValue(value, &I::get_PitchY);
    result.fillStyle = ReadValue(value, &I::get_FillStyle);
    result.multiPass = ReadValue(value, &I::get_MultiPass);
    return result;
}

CComPtr<IScanStrategyRectangular> MakeScanStrategyRectangular(const RectangularStrategy& value) {
    return CComObjectEx<CScanStrategyRectangular>::CreateInstance<IScanStrategyRectangular>(value);
}

CircularStrategy ReadScanStrategyCircular(IScanStrategyCircular* value) {
    RequireStrategy(value);
    using I = IScanStrategyCircular;
    CircularStrategy result;
    result.pitchT = ReadValue(value, &I::get_PitchT);
    result.pitchR = ReadValue(value, &I::get_PitchR);
    result.fillStyle = ReadValue(value, &I::get_FillStyle);
    result.scanType = ReadValue(value, &I::get_ScanType);
    result.multiPass = ReadValue(value, &I::get_MultiPass);
    return result;
}

CComPtr<IScanStrategyCircular> MakeScanStrategyCircular(const CircularStrategy& value) {
    return CComObjectEx<CScanStrategyCircular>::CreateInstance<IScanStrategyCircular>(value);
}

} // namespace Norvane::Lumis::Scanning

#include "core/scan_strategy_raster.h"

namespace Norvane::Lumis::Scanning {

CScanStrategyRaster::CScanStrategyRaster(const RasterStrategy& value)
    : orientation_(value.orientation), lineDirection_(value.lineDirection),
      frameDirection_(value.frameDirection), scanType_(value.scanType) {}

HRESULT CScanStrategyRaster::get_LineScanOrientation(ScanOrientation* value) {
    return orientation_.Get(IID_IScanStrategyRaster, value);
}

HRESULT CScanStrategyRaster::put_LineScanOrientation(ScanOrientation value) {
    return orientation_.Put(IID_IScanStrategyRaster, value, IsAnyValue<ScanOrientation>);
}

HRESULT CScanStrategyRaster::get_LineScanDirection(ScanDirection* value) {
    return lineDirection_.Get(IID_IScanStrategyRaster, value);
}

HRESULT CScanStrategyRaster::put_LineScanDirection(ScanDirection value) {
    return lineDirection_.Put(IID_IScanStrategyRaster, value, IsAnyValue<ScanDirection>);
}

HRESULT CScanStrategyRaster::get_FrameScanDirection(ScanDirection* value) {
    return frameDirection_.Get(IID_IScanStrategyRaster, value);
}

HRESULT CScanStrategyRaster::put_FrameScanDirection(ScanDirection value) {
    return frameDirection_.Put(IID_IScanStrategyRaster, value, IsAnyValue<ScanDirection>);
}

HRESULT CScanStrategyRaster::get_ScanType(ScanType* value) {
    return scanType_.Get(IID_IScanStrategyRaster, value);
}

HRESULT CScanStrategyRaster::put_ScanType(ScanType value) {
    return scanType_.Put(IID_IScanStrategyRaster, value, IsAnyValue<ScanType>);
}

} // namespace Norvane::Lumis::Scanning

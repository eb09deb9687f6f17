#include "core/raster_scan_definition.h"

#include "module/rectangle_int_impl.h"
#include "module/size_int.h"

namespace Norvane::Lumis::Scanning {

CRasterScanDefinition::CRasterScanDefinition(ISubPatternCollection* subPatterns,
                                             ScanSynchronizationSource scanSynchronizationSource,
                                             std::uint32_t gatePulseIdleTicks,
                                             std::uint32_t acquisitionUpdatePoints,
                                             const RasterScanValues& raster)
    : IScanDefinitionImpl(subPatterns, scanSynchronizationSource, gatePulseIdleTicks,
                          acquisitionUpdatePoints),
      raster_(raster) {}

HRESULT CRasterScanDefinition::get_ImageSize(ISizeInt** value) {
    return Guarded(IID_IRasterScanDefinition, value, [&] {
        *value = nullptr;
        *value = Common::CreateSizeInt(raster_.imageSize).Detach();
    });
}

HRESULT CRasterScanDefinition::get_LineInterlace(std::int32_t* value) {
    return Load(&RasterScanValues::lineInterlace, value);
}

HRESULT CRasterScanDefinition::get_ScanType(std::int32_t* value) {
    return Load(&RasterScanValues::scanType, value);
}

HRESULT CRasterScanDefinition::get_LineScanOrientation(std::int32_t* value) {
    return Load(&RasterScanValues::lineScanOrientation, value);
}

HRESULT CRasterScanDefinition::get_LineScanDirection(std::int32_t* value) {
    return Load(&RasterScanValues::lineScanDirection, value);
}

HRESULT CRasterScanDefinition::get_FrameScanDirection(std::int32_t* value) {
    return Load(&RasterScanValues::frameScanDirection, value);
}

HRESULT CRasterScanDefinition::get_SelectedArea(IRectangleInt** value) {
    return Guarded(IID_IRasterScanDefinition, value, [&] {
        *value = nullptr;
        *value = Common::CreateRectangleIntImpl(raster_.selectedArea).Detach();
    });
}

HRESULT CRasterScanDefinition::Load(std::int32_t RasterScanValues::*field, std::int32_t* out) const {
    return Guarded(IID_IRasterScanDefinition, out, [&] { *out = raster_.*field; });
}

} // namespace Norvane::Lumis::Scanning

#include "core/scan_definition_factory.h"

#include "core/pattern_scan_definition.h"
#include "core/raster_scan_definition.h"

#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

// A scan definition without sub patterns would hand the scan device nothing to play.
void RequireCollection(ISubPatternCollection* collection) {
    if (collection == nullptr)
        throw std::invalid_argument("collection object is null");
}

} // namespace

CComPtr<IScanDefinition>
CreatePatternScanDefinition(ISubPatternCollection* collection, ScanSynchronizationSource source,
                            std::uint32_t gatePulseIdleTicks, std::uint32_t acquisitionUpdatePoints,
                            bool allowSubPatternNavigation, bool blankBeamBetweenSubPatterns) {
    RequireCollection(collection);
    return CComObjectEx<CPatternScanDefinition>::CreateInstance<IScanDefinition>(
        collection, source, gatePulseIdleTicks, acquisitionUpdatePoints, allowSubPatternNavigation,
        blankBeamBetweenSubPatterns);
}

CComPtr<IScanDefinition>
CreateRasterScanDefinition(ISubPatternCollection* collection, ScanSynchronizationSource source,
                           std::uint32_t gatePulseIdleTicks, std::uint32_t acquisitionUpdatePoints,
                           SizeInt imageSize, std::int32_t lineInterlace, std::int32_t scanType,
                           std::int32_t lineScanOrientation, std::int32_t lineScanDirection,
                           std::int32_t frameScanDirection, RectangleInt selectedArea) {
    RequireCollection(collection);
    const RasterScanValues raster{imageSize,         lineInterlace,      scanType,    lineScanOrientation,
                                  lineScanDirection, frameScanDirection, selectedArea};
    return CComObjectEx<CRasterScanDefinition>::CreateInstance<IScanDefinition>(
        collection, source, gatePulseIdleTicks, acquisitionUpdatePoints, raster);
}

} // namespace Norvane::Lumis::Scanning

// The render output of the rasters: the shared scan-definition values plus the image geometry and the
// scan order the scan device plays. The image size and the selected area are handed out as new value
// objects on every call.
#pragma once

#include "core/scan_definition_impl.h"
#include "module/geometry_values.h"
#include "platform/object.h"

namespace Norvane::Lumis::Scanning {

// The raster-only values of a scan definition, in interface order.
struct RasterScanValues {
    SizeInt imageSize;
    std::int32_t lineInterlace{};
    std::int32_t scanType{};
    std::int32_t lineScanOrientation{};
    std::int32_t lineScanDirection{};
    std::int32_t frameScanDirection{};
    RectangleInt selectedArea; // in pixels
};

class CRasterScanDefinition : public CComObjectRootBase, public IScanDefinitionImpl<IRasterScanDefinition> {
  public:
    using Interfaces = InterfaceMap<IRasterScanDefinition>;

    CRasterScanDefinition(ISubPatternCollection* subPatterns,
                          ScanSynchronizationSource scanSynchronizationSource,
                          std::uint32_t gatePulseIdleTicks, std::uint32_t acquisitionUpdatePoints,
                          const RasterScanValues& raster);

    HRESULT get_ImageSize(ISizeInt** value) override;
    HRESULT get_LineInterlace(std::int32_t* value) override;
    HRESULT get_ScanType(std::int32_t* value) override;
    HRESULT get_LineScanOrientation(std::int32_t* value) override;
    HRESULT get_LineScanDirection(std::int32_t* value) override;
    HRESULT get_FrameScanDirection(std::int32_t* value) override;
    HRESULT get_SelectedArea(IRectangleInt** value) override;

  private:
    HRESULT Load(std::int32_t RasterScanValues::*field, std::int32_t* out) const;

    const RasterScanValues raster_;
};

} // namespace Norvane::Lumis::Scanning

#include "core/raster_rendering_properties.h"

#include "core/rendering_conversions.h"

namespace Norvane::Lumis::Scanning {

CRasterRenderingProperties::CRasterRenderingProperties(const RasterRenderingSettings& value)
    : targetDwellTimeResolution_(value.targetDwellTimeResolution),
      gatePulseIdleTime_(value.gatePulseIdleTime), mainsLockPeriod_(value.mainsLockPeriod),
      alignmentX_(value.alignmentX), alignmentY_(value.alignmentY) {}

HRESULT CRasterRenderingProperties::get_TargetDwellTimeResolution(double* value) {
    return targetDwellTimeResolution_.Get(IID_IRasterRenderingProperties, value);
}

HRESULT CRasterRenderingProperties::put_TargetDwellTimeResolution(double value) {
    return targetDwellTimeResolution_.Put(IID_IRasterRenderingProperties, value, IsAnyValue<double>);
}

HRESULT CRasterRenderingProperties::get_GatePulseIdleTime(double* value) {
    return gatePulseIdleTime_.Get(IID_IRasterRenderingProperties, value);
}

HRESULT CRasterRenderingProperties::put_GatePulseIdleTime(double value) {
    return gatePulseIdleTime_.Put(IID_IRasterRenderingProperties, value, IsAnyValue<double>);
}

HRESULT CRasterRenderingProperties::get_MainsLockPeriod(double* value) {
    return mainsLockPeriod_.Get(IID_IRasterRenderingProperties, value);
}

HRESULT CRasterRenderingProperties::put_MainsLockPeriod(double value) {
    return mainsLockPeriod_.Put(IID_IRasterRenderingProperties, value, IsAnyValue<double>);
}

HRESULT CRasterRenderingProperties::get_RasterAlignmentsX(IRasterAlignments** value) {
    return GetAlignment(alignmentX_, value);
}

HRESULT CRasterRenderingProperties::put_RasterAlignmentsX(IRasterAlignments* value) {
    return PutAlignment(alignmentX_, value, "RasterAlignmentsX");
}

HRESULT CRasterRenderingProperties::get_RasterAlignmentsY(IRasterAlignments** value) {
    return GetAlignment(alignmentY_, value);
}

HRESULT CRasterRenderingProperties::put_RasterAlignmentsY(IRasterAlignments* value) {
    return PutAlignment(alignmentY_, value, "RasterAlignmentsY");
}

HRESULT CRasterRenderingProperties::GetAlignment(const RasterAlignmentFields& alignment,
                                                 IRasterAlignments** value) {
    return Guarded(IID_IRasterRenderingProperties, value, [&] {
        *value = nullptr;
        *value = MakeRasterAlignments(alignment.Load()).Detach();
    });
}

HRESULT CRasterRenderingProperties::PutAlignment(RasterAlignmentFields& alignment, IRasterAlignments* value,
                                                 std::string_view name) {
    return Guarded(IID_IRasterRenderingProperties,
                   [&] { alignment.Store(ReadRasterAlignments(value, name)); });
}

} // namespace Norvane::Lumis::Scanning

#include "core/rendering_conversions.h"

#include "core/pattern_alignments.h"
#include "core/pattern_rendering_properties.h"
#include "core/raster_alignments.h"
#include "core/raster_rendering_properties.h"
#include "module/error_reporting.h"
#include "module/geometry_io.h"
#include "module/property_read.h"

#include <stdexcept>
#include <string>

namespace Norvane::Lumis::Scanning {

namespace {

void RequireObject(const void* value, std::string_view name) {
    if (value == nullptr)
        throw std::invalid_argument(std::string(name) + " object is null");
}

} // namespace

PatternAlignment ReadPatternAlignments(IPatternAlignments* value, std::string_view name) {
    RequireObject(value, name);
    PatternAlignment result;
    result.range = ReadRange(ReadObject(value, &IPatternAlignments::get_Range));
    result.slewRate = ReadValue(value, &IPatternAlignments::get_SlewRate);
    return result;
}

CComPtr<IPatternAlignments> MakePatternAlignments(const PatternAlignment& value) {
    return CComObjectEx<CPatternAlignments>::CreateInstance<IPatternAlignments>(value);
}

RasterAlignment ReadRasterAlignments(IRasterAlignments* value, std::string_view name) {
    RequireObject(value, name);
    RasterAlignment result;
    result.range = ReadRange(ReadObject(value, &IRasterAlignments::get_Range));
    result.slewRate = ReadValue(value, &IRasterAlignments::get_SlewRate);
    result.scanSync = ReadValue(value, &IRasterAlignments::get_ScanSync);
    result.preScan = ReadValue(value, &IRasterAlignments::get_PreScan);
    result.acquisitionWaitTime = ReadValue(value, &IRasterAlignments::get_AcquisitionWaitTime);
    result.acquisitionDelay = ReadValue(value, &IRasterAlignments::get_AcquisitionDelay);
    result.preFlyback = ReadValue(value, &IRasterAlignments::get_PreFlyback);
    return result;
}

CComPtr<IRasterAlignments> MakeRasterAlignments(const RasterAlignment& value) {
    return CComObjectEx<CRasterAlignments>::CreateInstance<IRasterAlignments>(value);
}

PatternRenderingSettings ReadPatternRenderingProperties(IPatternRenderingProperties* value) {
    if (value == nullptr)
        throw HResultException(E_INVALIDARG, "null IPatternRenderingProperties");
    using I = IPatternRenderingProperties;
    const auto alignmentY = ReadObject(value, &I::get_PatternAlignmentsY);
    const auto alignmentX = ReadObject(value, &I::get_PatternAlignmentsX);
    PatternRenderingSettings result;
    result.generationStrategy = ReadValue(value, &I::get_GenerationStrategy);
    result.patternStartAsymmetryTime = ReadValue(value, &I::get_PatternStartAsymmetryTime);
    result.postBlankingTime = ReadValue(value, &I::get_PostBlankingTime);
    result.preBlankingTime = ReadValue(value, &I::get_PreBlankingTime);
    result.gatePulseIdleTime = ReadValue(value, &I::get_GatePulseIdleTime);
    result.targetDwellTimeResolution = ReadValue(value, &I::get_TargetDwellTimeResolution);
    result.alignmentY = ReadPatternAlignments(alignmentY, "PatternAlignmentsY");
    result.alignmentX = ReadPatternAlignments(alignmentX, "PatternAlignmentsX");
    return result;
}

CComPtr<IPatternRenderingProperties> MakePatternRenderingProperties(const PatternRenderingSettings& value) {
    return CComObjectEx<CPatternRenderingProperties>::CreateInstance<IPatternRenderingProperties>(value);
}

RasterRenderingSettings ReadRasterRenderingProperties(IRasterRenderingProperties* value) {
    if (value == nullptr)
        throw std::invalid_argument("null IRasterRenderingProperties");
    using I = IRasterRenderingProperties;
    const auto alignmentY = ReadObject(value, &I::get_RasterAlignmentsY);
    const auto alignmentX = ReadObject(value, &I::get_RasterAlignmentsX);
    RasterRenderingSettings result;
    result.mainsLockPeriod = ReadValue(value, &I::get_MainsLockPeriod);
    result.gatePulseIdleTime = ReadValue(value, &I::get_GatePulseIdleTime);
    result.targetDwellTimeResolution = ReadValue(value, &I::get_TargetDwellTimeResolution);
    result.alignmentY = ReadRasterAlignments(alignmentY, "RasterAlignmentsY");
    result.alignmentX = ReadRasterAlignments(alignmentX, "RasterAlignmentsX");
    return result;
}

CComPtr<IRasterRenderingProperties> MakeRasterRenderingProperties(const RasterRenderingSettings& value) {
    return CComObjectEx<CRasterRenderingProperties>::CreateInstance<IRasterRenderingProperties>(value);
}

} // namespace Norvane::Lumis::Scanning

// Conversions between the rendering-properties and alignment objects and the records patterns hold.
// Readers go through the public interface, so they accept any implementation; makers create the
// library's own objects holding a copy of the record. Failed getters throw their HRESULT with the
// callee's error information.
#pragma once

#include "core/rendering_settings.h"
#include "platform/com_ptr.h"

#include <beamweaver/rendering.h>

#include <string_view>

namespace Norvane::Lumis::Scanning {

// Reads Range, then SlewRate. Null throws std::invalid_argument "<name> object is null", where name is
// the property the object came through ("PatternAlignmentsX").
PatternAlignment ReadPatternAlignments(IPatternAlignments* value, std::string_view name);
CComPtr<IPatternAlignments> MakePatternAlignments(const PatternAlignment& value);

// Reads Range, SlewRate, ScanSync, PreScan, AcquisitionWaitTime, AcquisitionDelay, PreFlyback. Null as
// for pattern alignments.
RasterAlignment ReadRasterAlignments(IRasterAlignments* value, std::string_view name);
CComPtr<IRasterAlignments> MakeRasterAlignments(const RasterAlignment& value);

// Null throws HResultException(E_INVALIDARG, "null IPatternRenderingProperties"). Reads the Y and X
// alignment objects, GenerationStrategy, PatternStartAsymmetryTime, PostBlankingTime, PreBlankingTime,
// GatePulseIdleTime, TargetDwellTimeResolution, then the values of the Y and of the X alignment.
PatternRenderingSettings ReadPatternRenderingProperties(IPatternRenderingProperties* value);
CComPtr<IPatternRenderingProperties> MakePatternRenderingProperties(const PatternRenderingSettings& value);

// Null throws std::invalid_argument "null IRasterRenderingProperties". Reads the Y and X alignment
// objects, MainsLockPeriod, GatePulseIdleTime, TargetDwellTimeResolution, then the values of the Y and of
// the X alignment.
RasterRenderingSettings ReadRasterRenderingProperties(IRasterRenderingProperties* value);
CComPtr<IRasterRenderingProperties> MakeRasterRenderingProperties(const RasterRenderingSettings& value);

} // namespace Norvane::Lumis::Scanning

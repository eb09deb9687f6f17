// A raster's rendering properties as a value object: the RasterRenderingSettings record. The plain
// values are stored unchecked; the alignments are held by value and their getters hand out new
// alignment objects holding copies. Value object: no lock (see ValueField), no ISupportErrorInfo.
#pragma once

#include "core/alignment_fields.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/rendering.h>

#include <string_view>

namespace Norvane::Lumis::Scanning {

// Created by clients through its class identifier and by the library when it hands rendering properties
// out; both start from the defaults of RasterRenderingSettings or hold a copy of the record given.
class CRasterRenderingProperties : public CComObjectRootBase,
                                   public IDispatchImpl<IRasterRenderingProperties> {
  public:
    using Interfaces = InterfaceMap<IRasterRenderingProperties>;

    explicit CRasterRenderingProperties(const RasterRenderingSettings& value = RasterRenderingSettings{});

    HRESULT get_TargetDwellTimeResolution(double* value) override;
    HRESULT put_TargetDwellTimeResolution(double value) override;
    HRESULT get_GatePulseIdleTime(double* value) override;
    HRESULT put_GatePulseIdleTime(double value) override;
    HRESULT get_MainsLockPeriod(double* value) override;
    HRESULT put_MainsLockPeriod(double value) override;
    HRESULT get_RasterAlignmentsX(IRasterAlignments** value) override;
    // Stores the seven values read from value; null fails with "RasterAlignmentsX object is null".
    HRESULT put_RasterAlignmentsX(IRasterAlignments* value) override;
    HRESULT get_RasterAlignmentsY(IRasterAlignments** value) override;
    HRESULT put_RasterAlignmentsY(IRasterAlignments* value) override;

  private:
    static HRESULT GetAlignment(const RasterAlignmentFields& alignment, IRasterAlignments** value);
    static HRESULT PutAlignment(RasterAlignmentFields& alignment, IRasterAlignments* value,
                                std::string_view name);

    ValueField<double> targetDwellTimeResolution_;
    ValueField<double> gatePulseIdleTime_;
    ValueField<double> mainsLockPeriod_;
    RasterAlignmentFields alignmentX_;
    RasterAlignmentFields alignmentY_;
};

} // namespace Norvane::Lumis::Scanning

// One axis of a raster's rendering properties as a value object: the DAC span of the full field of view
// (minimum >= 0, minimum <= maximum), the slew rate (> 0) and the raster timing in seconds (each >= 0).
#pragma once

#include "core/scan_alignments_impl.h"

namespace Norvane::Lumis::Scanning {

// Created by clients through its class identifier and by the library when it hands an alignment out;
// both start from the defaults of RasterAlignment or hold a copy of the record they were made with.
class CRasterAlignments
    : public CScanAlignmentsImpl<IRasterAlignments, RasterAlignmentFields, RangeEnds::MayBeEqual> {
  public:
    using CScanAlignmentsImpl::CScanAlignmentsImpl;

    HRESULT get_ScanSync(double* value) override;
    HRESULT put_ScanSync(double value) override;
    HRESULT get_PreScan(double* value) override;
    HRESULT put_PreScan(double value) override;
    HRESULT get_AcquisitionWaitTime(double* value) override;
    HRESULT put_AcquisitionWaitTime(double value) override;
    HRESULT get_AcquisitionDelay(double* value) override;
    HRESULT put_AcquisitionDelay(double value) override;
    HRESULT get_PreFlyback(double* value) override;
    HRESULT put_PreFlyback(double value) override;
};

} // namespace Norvane::Lumis::Scanning

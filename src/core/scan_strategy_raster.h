// The raster scan strategy as a value object: the RasterStrategy record, every value stored unchecked.
// Value object: no lock (see ValueField), no ISupportErrorInfo.
#pragma once

#include "core/scan_strategy_values.h"
#include "core/value_field.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/strategies.h>

namespace Norvane::Lumis::Scanning {

// Created by clients through its class identifier and by patterns when they hand their strategy out;
// both start from the defaults of RasterStrategy or hold a copy of the record given.
class CScanStrategyRaster : public CComObjectRootBase, public IDispatchImpl<IScanStrategyRaster> {
  public:
    using Interfaces = InterfaceMap<IScanStrategyRaster>;

    explicit CScanStrategyRaster(const RasterStrategy& value = RasterStrategy{});

    HRESULT get_LineScanOrientation(ScanOrientation* value) override;
    HRESULT put_LineScanOrientation(ScanOrientation value) override;
    HRESULT get_LineScanDirection(ScanDirection* value) override;
    HRESULT put_LineScanDirection(ScanDirection value) override;
    HRESULT get_FrameScanDirection(ScanDirection* value) override;
    HRESULT put_FrameScanDirection(ScanDirection value) override;
    HRESULT get_ScanType(ScanType* value) override;
    HRESULT put_ScanType(ScanType value) override;

  private:
    ValueField<ScanOrientation> orientation_;
    ValueField<ScanDirection> lineDirection_;
    ValueField<ScanDirection> frameDirection_;
    ValueField<ScanType> scanType_;
};

} // namespace Norvane::Lumis::Scanning

// The rectangular scan strategy as a value object: the RectangularStrategy record, every value stored
// unchecked (a zero or negative pitch, an unknown fill style or multi-pass are kept as given).
// Value object: no lock (see ValueField), no ISupportErrorInfo.
#pragma once

#include "core/scan_strategy_values.h"
#include "core/value_field.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/strategies.h>

namespace Norvane::Lumis::Scanning {

// Created by clients through its class identifier and by patterns when they hand their strategy out;
// both start from the defaults of RectangularStrategy or hold a copy of the record given.
class CScanStrategyRectangular : public CComObjectRootBase, public IDispatchImpl<IScanStrategyRectangular> {
  public:
    using Interfaces = InterfaceMap<IScanStrategyRectangular>;

    explicit CScanStrategyRectangular(const RectangularStrategy& value = RectangularStrategy{});

    HRESULT get_LineScanOrientation(ScanOrientation* value) override;
    HRESULT put_LineScanOrientation(ScanOrientation value) override;
    HRESULT get_LineScanDirection(ScanDirection* value) override;
    HRESULT put_LineScanDirection(ScanDirection value) override;
    HRESULT get_FrameScanDirection(ScanDirection* value) override;
    HRESULT put_FrameScanDirection(ScanDirection value) override;
    HRESULT get_ScanType(ScanType* value) override;
    HRESULT put_ScanType(ScanType value) override;
    HRESULT get_PitchX(double* value) override;
    HRESULT put_PitchX(double value) override;
    HRESULT get_PitchY(double* value) override;
    HRESULT put_PitchY(double value) override;
    HRESULT get_FillStyle(FillStyle* value) override;
    HRESULT put_FillStyle(FillStyle value) override;
    HRESULT get_MultiPass(MultiPass* value) override;
    HRESULT put_MultiPass(MultiPass value) override;

  private:
    ValueField<double> pitchX_;
    ValueField<double> pitchY_;
    ValueField<ScanOrientation> orientation_;
    ValueField<ScanDirection> lineDirection_;
    ValueField<ScanDirection> frameDirection_;
    ValueField<FillStyle> fillStyle_;
    ValueField<ScanType> scanType_;
    ValueField<MultiPass> multiPass_;
};

} // namespace Norvane::Lumis::Scanning

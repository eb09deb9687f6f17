// The circular scan strategy as a value object: the CircularStrategy record, every value stored unchecked.
// Value object: no lock (see ValueField), no ISupportErrorInfo.
#pragma once

#include "core/scan_strategy_values.h"
#include "core/value_field.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/strategies.h>

namespace Norvane::Lumis::Scanning {

// Created by clients through its class identifier and by patterns when they hand their strategy out;
// both start from the defaults of CircularStrategy or hold a copy of the record given.
class CScanStrategyCircular : public CComObjectRootBase, public IDispatchImpl<IScanStrategyCircular> {
  public:
    using Interfaces = InterfaceMap<IScanStrategyCircular>;

    explicit CScanStrategyCircular(const CircularStrategy& value = CircularStrategy{});

    HRESULT get_PitchT(double* value) override;
    HRESULT put_PitchT(double value) override;
    HRESULT get_PitchR(double* value) override;
    HRESULT put_PitchR(double value) override;
    HRESULT get_FillStyle(FillStyle* value) override;
    HRESULT put_FillStyle(FillStyle value) override;
    HRESULT get_ScanType(CircleScanType* value) override;
    HRESULT put_ScanType(CircleScanType value) override;
    HRESULT get_MultiPass(MultiPass* value) override;
    HRESULT put_MultiPass(MultiPass value) override;

  private:
    ValueField<double> pitchT_;
    ValueField<double> pitchR_;
    ValueField<FillStyle> fillStyle_;
    ValueField<CircleScanType> scanType_;
    ValueField<MultiPass> multiPass_;
};

} // namespace Norvane::Lumis::Scanning

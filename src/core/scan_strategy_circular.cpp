#include "core/scan_strategy_circular.h"

namespace Norvane::Lumis::Scanning {

CScanStrategyCircular::CScanStrategyCircular(const CircularStrategy& value)
    : pitchT_(value.pitchT), pitchR_(value.pitchR), fillStyle_(value.fillStyle), scanType_(value.scanType),
      multiPass_(value.multiPass) {}

HRESULT CScanStrategyCircular::get_PitchT(double* value) {
    return pitchT_.Get(IID_IScanStrategyCircular, value);
}

HRESULT CScanStrategyCircular::put_PitchT(double value) {
    return pitchT_.Put(IID_IScanStrategyCircular, value, IsAnyValue<double>);
}

HRESULT CScanStrategyCircular::get_PitchR(double* value) {
    return pitchR_.Get(IID_IScanStrategyCircular, value);
}

HRESULT CScanStrategyCircular::put_PitchR(double value) {
    return pitchR_.Put(IID_IScanStrategyCircular, value, IsAnyValue<double>);
}

HRESULT CScanStrategyCircular::get_FillStyle(FillStyle* value) {
    return fillStyle_.Get(IID_IScanStrategyCircular, value);
}

HRESULT CScanStrategyCircular::put_FillStyle(FillStyle value) {
    return fillStyle_.Put(IID_IScanStrategyCircular, value, IsAnyValue<FillStyle>);
}

HRESULT CScanStrategyCircular::get_ScanType(CircleScanType* value) {
    return scanType_.Get(IID_IScanStrategyCircular, value);
}

HRESULT CScanStrategyCircular::put_ScanType(CircleScanType value) {
    return scanType_.Put(IID_IScanStrategyCircular, value, IsAnyValue<CircleScanType>);
}

HRESULT CScanStrategyCircular::get_MultiPass(MultiPass* value) {
    return multiPass_.Get(IID_IScanStrategyCircular, value);
}

HRESULT CScanStrategyCircular::put_MultiPass(MultiPass value) {
    return multiPass_.Put(IID_IScanStrategyCircular, value, IsAnyValue<MultiPass>);
}

} // namespace Norvane::Lumis::Scanning

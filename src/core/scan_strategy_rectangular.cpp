#include "core/scan_strategy_rectangular.h"

namespace Norvane::Lumis::Scanning {

CScanStrategyRectangular::CScanStrategyRectangular(const RectangularStrategy& value)
    : pitchX_(value.pitchX), pitchY_(value.pitchY), orientation_(value.orientation),
      lineDirection_(value.lineDirection), frameDirection_(value.frameDirection), fillStyle_(value.fillStyle),
      scanType_(value.scanType), multiPass_(value.multiPass) {}

HRESULT CScanStrategyRectangular::get_LineScanOrientation(ScanOrientation* value) {
    return orientation_.Get(IID_IScanStrategyRectangular, value);
}

HRESULT CScanStrategyRectangular::put_LineScanOrientation(ScanOrientation value) {
    return orientation_.Put(IID_IScanStrategyRectangular, value, IsAnyValue<ScanOrientation>);
}

HRESULT CScanStrategyRectangular::get_LineScanDirection(ScanDirection* value) {
    return lineDirection_.Get(IID_IScanStrategyRectangular, value);
}

HRESULT CScanStrategyRectangular::put_LineScanDirection(ScanDirection value) {
    return lineDirection_.Put(IID_IScanStrategyRectangular, value, IsAnyValue<ScanDirection>);
}

HRESULT CScanStrategyRectangular::get_FrameScanDirection(ScanDirection* value) {
    return frameDirection_.Get(IID_IScanStrategyRectangular, value);
}

HRESULT CScanStrategyRectangular::put_FrameScanDirection(ScanDirection value) {
    return frameDirection_.Put(IID_IScanStrategyRectangular, value, IsAnyValue<ScanDirection>);
}

HRESULT CScanStrategyRectangular::get_ScanType(ScanType* value) {
    return scanType_.Get(IID_IScanStrategyRectangular, value);
}

HRESULT CScanStrategyRectangular::put_ScanType(ScanType value) {
    return scanType_.Put(IID_IScanStrategyRectangular, value, IsAnyValue<ScanType>);
}

HRESULT CScanStrategyRectangular::get_PitchX(double* value) {
    return pitchX_.Get(IID_IScanStrategyRectangular, value);
}

HRESULT CScanStrategyRectangular::put_PitchX(double value) {
    return pitchX_.Put(IID_IScanStrategyRectangular, value, IsAnyValue<double>);
}

HRESULT CScanStrategyRectangular::get_PitchY(double* value) {
    return pitchY_.Get(IID_IScanStrategyRectangular, value);
}

HRESULT CScanStrategyRectangular::put_PitchY(double value) {
    return pitchY_.Put(IID_IScanStrategyRectangular, value, IsAnyValue<double>);
}

HRESULT CScanStrategyRectangular::get_FillStyle(FillStyle* value) {
    return fillStyle_.Get(IID_IScanStrategyRectangular, value);
}

HRESULT CScanStrategyRectangular::put_FillStyle(FillStyle value) {
    return fillStyle_.Put(IID_IScanStrategyRectangular, value, IsAnyValue<FillStyle>);
}

HRESULT CScanStrategyRectangular::get_MultiPass(MultiPass* value) {
    return multiPass_.Get(IID_IScanStrategyRectangular, value);
}

HRESULT CScanStrategyRectangular::put_MultiPass(MultiPass value) {
    return multiPass_.Put(IID_IScanStrategyRectangular, value, IsAnyValue<MultiPass>);
}

} // namespace Norvane::Lumis::Scanning

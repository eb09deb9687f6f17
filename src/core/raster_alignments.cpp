#include "core/raster_alignments.h"

namespace Norvane::Lumis::Scanning {

HRESULT CRasterAlignments::get_ScanSync(double* value) {
    return fields_.scanSync.Get(IID_IRasterAlignments, value);
}

HRESULT CRasterAlignments::put_ScanSync(double value) {
    return fields_.scanSync.Put(IID_IRasterAlignments, value, IsNotNegative);
}

HRESULT CRasterAlignments::get_PreScan(double* value) {
    return fields_.preScan.Get(IID_IRasterAlignments, value);
}

HRESULT CRasterAlignments::put_PreScan(double value) {
    return fields_.preScan.Put(IID_IRasterAlignments, value, IsNotNegative);
}

HRESULT CRasterAlignments::get_AcquisitionWaitTime(double* value) {
    return fields_.acquisitionWaitTime.Get(IID_IRasterAlignments, value);
}

HRESULT CRasterAlignments::put_AcquisitionWaitTime(double value) {
    return fields_.acquisitionWaitTime.Put(IID_IRasterAlignments, value, IsNotNegative);
}

HRESULT CRasterAlignments::get_AcquisitionDelay(double* value) {
    return fields_.acquisitionDelay.Get(IID_IRasterAlignments, value);
}

HRESULT CRasterAlignments::put_AcquisitionDelay(double value) {
    return fields_.acquisitionDelay.Put(IID_IRasterAlignments, value, IsNotNegative);
}

HRESULT CRasterAlignments::get_PreFlyback(double* value) {
    return fields_.preFlyback.Get(IID_IRasterAlignments, value);
}

HRESULT CRasterAlignments::put_PreFlyback(double value) {
    return fields_.preFlyback.Put(IID_IRasterAlignments, value, IsNotNegative);
}

} // namespace Norvane::Lumis::Scanning

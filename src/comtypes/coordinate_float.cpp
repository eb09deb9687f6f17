#include "comtypes/coordinate_float.h"

namespace Norvane::ComTypes {

HRESULT CCoordinateFloat::get_X(double* value) {
    return x_.Get(IID_ICoordinateFloat, value);
}

HRESULT CCoordinateFloat::put_X(double value) {
    return x_.Put(value);
}

HRESULT CCoordinateFloat::get_Y(double* value) {
    return y_.Get(IID_ICoordinateFloat, value);
}

HRESULT CCoordinateFloat::put_Y(double value) {
    return y_.Put(value);
}

} // namespace Norvane::ComTypes

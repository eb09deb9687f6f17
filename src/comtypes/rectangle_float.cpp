#include "comtypes/rectangle_float.h"

namespace Norvane::ComTypes {

HRESULT CRectangleFloat::get_Left(double* value) {
    return left_.Get(IID_IRectangleFloat, value);
}

HRESULT CRectangleFloat::put_Left(double value) {
    return left_.Put(value);
}

HRESULT CRectangleFloat::get_Top(double* value) {
    return top_.Get(IID_IRectangleFloat, value);
}

HRESULT CRectangleFloat::put_Top(double value) {
    return top_.Put(value);
}

HRESULT CRectangleFloat::get_Right(double* value) {
    return right_.Get(IID_IRectangleFloat, value);
}

HRESULT CRectangleFloat::put_Right(double value) {
    return right_.Put(value);
}

HRESULT CRectangleFloat::get_Bottom(double* value) {
    return bottom_.Get(IID_IRectangleFloat, value);
}

HRESULT CRectangleFloat::put_Bottom(double value) {
    return bottom_.Put(value);
}

} // namespace Norvane::ComTypes

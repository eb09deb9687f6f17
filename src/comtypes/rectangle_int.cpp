#include "comtypes/rectangle_int.h"

namespace Norvane::ComTypes {

HRESULT CRectangleInt::get_Left(std::int32_t* value) {
    return left_.Get(IID_IRectangleInt, value);
}

HRESULT CRectangleInt::put_Left(std::int32_t value) {
    return left_.Put(value);
}

HRESULT CRectangleInt::get_Top(std::int32_t* value) {
    return top_.Get(IID_IRectangleInt, value);
}

HRESULT CRectangleInt::put_Top(std::int32_t value) {
    return top_.Put(value);
}

HRESULT CRectangleInt::get_Right(std::int32_t* value) {
    return right_.Get(IID_IRectangleInt, value);
}

HRESULT CRectangleInt::put_Right(std::int32_t value) {
    return right_.Put(value);
}

HRESULT CRectangleInt::get_Bottom(std::int32_t* value) {
    return bottom_.Get(IID_IRectangleInt, value);
}

HRESULT CRectangleInt::put_Bottom(std::int32_t value) {
    return bottom_.Put(value);
}

} // namespace Norvane::ComTypes

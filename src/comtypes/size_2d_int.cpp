#include "comtypes/size_2d_int.h"

namespace Norvane::ComTypes {

HRESULT CSize2DInt::get_Width(std::int32_t* value) {
    return width_.Get(IID_ISize2DInt, value);
}

HRESULT CSize2DInt::put_Width(std::int32_t value) {
    return width_.Put(value);
}

HRESULT CSize2DInt::get_Height(std::int32_t* value) {
    return height_.Get(IID_ISize2DInt, value);
}

HRESULT CSize2DInt::put_Height(std::int32_t value) {
    return height_.Put(value);
}

} // namespace Norvane::ComTypes

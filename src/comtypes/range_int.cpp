#include "comtypes/range_int.h"

namespace Norvane::ComTypes {

HRESULT CRangeInt::get_Minimum(std::int32_t* value) {
    return minimum_.Get(IID_IRangeInt, value);
}

HRESULT CRangeInt::put_Minimum(std::int32_t value) {
    return minimum_.Put(value);
}

HRESULT CRangeInt::get_Maximum(std::int32_t* value) {
    return maximum_.Get(IID_IRangeInt, value);
}

HRESULT CRangeInt::put_Maximum(std::int32_t value) {
    return maximum_.Put(value);
}

} // namespace Norvane::ComTypes

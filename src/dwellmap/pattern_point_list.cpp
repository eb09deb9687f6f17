#include "dwellmap/pattern_point_list.h"

#include "dwellmap/pattern_point_buffer.h"
#include "module/method_guard.h"

namespace Norvane::Dwellmap {

HRESULT CPatternPointList::GetCount(std::int32_t* count) {
    return Guarded(IID_IPatternPointList, count,
                   [&] { *count = static_cast<std::int32_t>(storage_.Count()); });
}

HRESULT CPatternPointList::SetCount(std::uint32_t count) {
    if (count > kMaximumCount)
        return E_INVALIDARG;
    return Guarded(IID_IPatternPointList, [&] { storage_.Resize(count); });
}

HRESULT CPatternPointList::GetPointBuffer(IPatternPointBuffer** buffer) {
    return Guarded(IID_IPatternPointList, buffer, [&] {
        *buffer = nullptr;
        IPatternPointList* self = this;
        *buffer =
            CComObjectEx<CPatternPointBuffer>::CreateInstance<IPatternPointBuffer>(self, storage_).Detach();
    });
}

HRESULT CPatternPointList::SetPointCount(std::uint32_t count) {
    if (count > storage_.Count())
        return E_INVALIDARG;
    return Guarded(IID_IPatternPointListCount, [&] { storage_.Resize(count); });
}

} // namespace Norvane::Dwellmap

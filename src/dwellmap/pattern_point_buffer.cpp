#include "dwellmap/pattern_point_buffer.h"

namespace Norvane::Dwellmap {

CPatternPointBuffer::CPatternPointBuffer(IPatternPointList* list, PointStorage& storage)
    : list_(list), storage_(storage) {
    storage_.Pin();
}

CPatternPointBuffer::~CPatternPointBuffer() {
    storage_.Unpin();
}

// Nothing here can throw: the checks and the pointer arithmetic are the whole work.
HRESULT CPatternPointBuffer::GetRange(std::uint32_t first, std::uint32_t last, PatternPoint** begin,
                                      PatternPoint** end) {
    if (begin == nullptr || end == nullptr)
        return E_POINTER;
    if (first > last || last > storage_.Count())
        return E_INVALIDARG;
    *begin = storage_.Data() + first;
    *end = storage_.Data() + last;
    return S_OK;
}

} // namespace Norvane::Dwellmap

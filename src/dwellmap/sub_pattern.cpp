#include "dwellmap/sub_pattern.h"

#include "module/method_guard.h"

#include <utility>

namespace Norvane::Dwellmap {

CSubPattern::CSubPattern(SubPatternEntry entry) : entry_(std::move(entry)) {}

HRESULT CSubPattern::get_PointList(IPatternPointList** value) {
    return Guarded(IID_ISubPattern, value, [&] { return entry_.pointList.CopyTo(value); });
}

HRESULT CSubPattern::get_Value(std::int32_t* value) {
    return Guarded(IID_ISubPattern, value, [&] { *value = entry_.value; });
}

HRESULT CSubPattern::get_OffsetX(std::uint16_t* value) {
    return Guarded(IID_ISubPattern, value, [&] { *value = entry_.offsetX; });
}

HRESULT CSubPattern::get_OffsetY(std::uint16_t* value) {
    return Guarded(IID_ISubPattern, value, [&] { *value = entry_.offsetY; });
}

HRESULT CSubPattern::get_RepeatCount(std::uint32_t* value) {
    return Guarded(IID_ISubPattern, value, [&] { *value = entry_.repeatCount; });
}

} // namespace Norvane::Dwellmap

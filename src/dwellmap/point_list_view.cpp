#include "dwellmap/point_list_view.h"

#include "module/error_reporting.h"

#include <stdexcept>

namespace Norvane::Dwellmap {

std::uint32_t PointCountOf(IPatternPointList* list) {
    std::int32_t count = 0;
    CheckResult(list->GetCount(&count));
    if (count < 0)
        throw std::range_error("point list reports a negative point count");
    return static_cast<std::uint32_t>(count);
}

PointListView::PointListView(IPatternPointList* list) {
    const std::uint32_t count = PointCountOf(list);
    CheckResult(list->GetPointBuffer(&buffer_));
    PatternPoint* begin = nullptr;
    PatternPoint* end = nullptr;
    CheckResult(buffer_->GetRange(0, count, &begin, &end));
    points_ = std::span<const PatternPoint>(begin, end);
}

} // namespace Norvane::Dwellmap

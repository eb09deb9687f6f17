#include "core/point_buffer_view.h"

#include "module/error_reporting.h"

namespace Norvane::Lumis::Scanning {

PointBufferView::PointBufferView(IPatternPointList* list, std::uint32_t first, std::uint32_t last) {
    CheckResult(list->GetPointBuffer(&buffer_));
    PatternPoint* begin = nullptr;
    PatternPoint* end = nullptr;
    CheckResult(buffer_->GetRange(first, last, &begin, &end));
    points_ = std::span<PatternPoint>(begin, static_cast<std::size_t>(end - begin));
}

PointBufferView::PointBufferView(IPatternPointList* list) : PointBufferView(list, 0, PointCount(list)) {}

std::uint32_t PointCount(IPatternPointList* list) {
    std::int32_t count = 0;
    CheckResult(list->GetCount(&count));
    return count > 0 ? static_cast<std::uint32_t>(count) : 0u;
}

} // namespace Norvane::Lumis::Scanning

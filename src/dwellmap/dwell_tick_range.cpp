#include "dwellmap/dwell_tick_range.h"

#include <algorithm>

namespace Norvane::Dwellmap {

void DwellTickRange::Include(std::span<const PatternPoint> points) {
    for (const PatternPoint& point : points) {
        minimum_ = std::min(minimum_, point.dwell);
        maximum_ = std::max(maximum_, point.dwell);
    }
    empty_ = empty_ && points.empty();
}

} // namespace Norvane::Dwellmap

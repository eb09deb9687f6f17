// The smallest and largest dwell tick count over any number of point ranges.
#pragma once

#include <beamweaver/dwellmap.h>

#include <cstdint>
#include <limits>
#include <span>

namespace Norvane::Dwellmap {

class DwellTickRange {
  public:
    void Include(std::span<const PatternPoint> points);

    // Both are 0 while no point has been included.
    std::uint16_t Minimum() const { return empty_ ? 0 : minimum_; }
    std::uint16_t Maximum() const { return empty_ ? 0 : maximum_; }

  private:
    std::uint16_t minimum_ = std::numeric_limits<std::uint16_t>::max();
    std::uint16_t maximum_ = 0;
    bool empty_ = true;
};

} // namespace Norvane::Dwellmap

// Direct access to the points of a point list, valid while the view lives.
#pragma once

#include "platform/com_ptr.h"

#include <beamweaver/dwellmap.h>

#include <cstdint>
#include <span>

namespace Norvane::Lumis::Scanning {

class PointBufferView {
  public:
    // The points [first, last) of the list; the list must hold at least last points.
    PointBufferView(IPatternPointList* list, std::uint32_t first, std::uint32_t last);
    // Every point of the list.
    explicit PointBufferView(IPatternPointList* list);

    std::span<PatternPoint> Points() const { return points_; }

  private:
    CComPtr<IPatternPointBuffer> buffer_;
    std::span<PatternPoint> points_;
};

// The number of points in a list.
std::uint32_t PointCount(IPatternPointList* list);

} // namespace Norvane::Lumis::Scanning

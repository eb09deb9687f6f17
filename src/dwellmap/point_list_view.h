// Read access to every point of a list through the list's own interfaces, so a collection works with any
// implementation of IPatternPointList. Failed calls throw HResultException with the list's error.
#pragma once

#include "platform/com_ptr.h"

#include <beamweaver/dwellmap.h>

#include <cstdint>
#include <span>

namespace Norvane::Dwellmap {

// The list's count; a negative count throws std::range_error.
std::uint32_t PointCountOf(IPatternPointList* list);

class PointListView {
  public:
    explicit PointListView(IPatternPointList* list);

    // Valid as long as the view lives: the view holds the list's point buffer.
    std::span<const PatternPoint> Points() const { return points_; }

  private:
    CComPtr<IPatternPointBuffer> buffer_;
    std::span<const PatternPoint> points_;
};

} // namespace Norvane::Dwellmap

// What a collection keeps per sub pattern: the list given to Add (shared, not copied) and its placement.
#pragma once

#include "platform/com_ptr.h"

#include <beamweaver/dwellmap.h>

#include <cstdint>

namespace Norvane::Dwellmap {

struct SubPatternEntry {
    CComPtr<IPatternPointList> pointList;
    std::int32_t value = 0;
    std::uint16_t offsetX = 0;
    std::uint16_t offsetY = 0;
    std::uint32_t repeatCount = 0;
};

} // namespace Norvane::Dwellmap

#include "tools/rendered_scan.h"

#include <numeric>

namespace Norvane::Lumis::Scanning::Tool {

std::uint64_t PointCount(const RenderedScan& scan) {
    return std::accumulate(
        scan.subPatterns.begin(), scan.subPatterns.end(), std::uint64_t{0},
        [](std::uint64_t sum, const RenderedSubPattern& s) { return sum + s.points.size(); });
}

} // namespace Norvane::Lumis::Scanning::Tool

#include "shapes/line_generator.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

constexpr std::int64_t kMaxListPoints = std::numeric_limits<std::int32_t>::max();

[[noreturn]] void ThrowPitchOutOfRange() {
    throw std::invalid_argument("Pitch out of range. ");
}

double LineLength(const LineGeometry& line) {
    const double dx = line.end.x - line.begin.x;
    const double dy = line.end.y - line.begin.y;
    return std::sqrt(dx * dx + dy * dy);
}

DacPosition PositionAt(const LineLayout& layout, std::int32_t index) {
    const double steps = index;
    return {TruncToInt32(layout.first.x + steps * layout.step.x),
            TruncToInt32(layout.first.y + steps * layout.step.y)};
}

// The forward pass in runs of equal dwell through the pattern's writer: one run when the dwell is
// constant, short runs along a ramp. Returns the next free index.
std::int32_t WriteForwardPass(std::span<PatternPoint> points, std::int32_t index, const LineLayout& layout,
                              const DwellRamp& ramp, const CPattern& pattern) {
    std::int32_t runStart = 0;
    while (runStart < layout.count) {
        const std::uint16_t ticks = ramp.TicksAt(runStart);
        std::int32_t runEnd = runStart + 1;
        while (runEnd < layout.count && ramp.TicksAt(runEnd) == ticks)
            ++runEnd;
        index = pattern
                    .AddPoints(points, PositionAt(layout, runStart), layout.step, runEnd - runStart, ticks,
                               PointFlag_Acquire, index)
                    .nextIndex;
        runStart = runEnd;
    }
    return index;
}

// The return pass visits the forward positions in reverse order, each with its forward dwell: the
// forward pass mirrored. Returns the next free index.
std::int32_t WriteReturnPass(std::span<PatternPoint> points, std::int32_t index, std::int32_t count) {
    const auto forward =
        points.subspan(static_cast<std::size_t>(index - count), static_cast<std::size_t>(count));
    std::reverse_copy(forward.begin(), forward.end(), points.begin() + index);
    return index + count;
}

} // namespace

std::uint16_t DwellRamp::TicksAt(std::int32_t index) const {
    return ToDwellTicks(static_cast<double>(index) * increment + first);
}

std::int32_t LinePointCount(const LineGeometry& line) {
    const double count = std::trunc(LineLength(line) / line.pitch) + 1.0;
    if (!(count <= static_cast<double>(kMaxListPoints)))
        ThrowPitchOutOfRange();
    return static_cast<std::int32_t>(count);
}

std::int32_t LinePassCount(const LineGeometry& line) {
    return line.multiPass == MultiPass_OneOrientation ? 2 : 1;
}

double LineMeanDwellTime(const LineGeometry& line) {
    return (line.beginDwellTime + line.endDwellTime) / 2.0;
}

double LineEffectiveLoopTime(const LineGeometry& line) {
    return LinePointCount(line) * LineMeanDwellTime(line);
}

LineLayout LayOutLine(const LineGeometry& line, const CPattern& pattern) {
    const double angle = std::atan2(line.end.y - line.begin.y, line.end.x - line.begin.x);
    const bool reverse = line.scanDirection == ScanDirection_Reverse;
    const double sign = reverse ? -1.0 : 1.0;
    const coordinate<double> anchor = reverse ? line.begin : line.end;

    LineLayout layout;
    layout.count = LinePointCount(line);
    layout.step = {sign * pattern.RelativeToDacSpanX(std::cos(angle) * line.pitch),
                   sign * pattern.RelativeToDacSpanY(std::sin(angle) * line.pitch)};
    layout.anchor = pattern.RelativeToDac(anchor.x, anchor.y);
    const double stepsBack = layout.count - 1;
    layout.first = {TruncToInt32(layout.anchor.x - stepsBack * layout.step.x),
                    TruncToInt32(layout.anchor.y - stepsBack * layout.step.y)};
    return layout;
}

DwellRamp LineDwellRamp(const LineGeometry& line, std::int32_t count, double resolution) {
    DwellRamp ramp;
    ramp.first = std::trunc(line.beginDwellTime / resolution);
    if (count > 1)
        ramp.increment = (line.endDwellTime - line.beginDwellTime) / (count - 1) / resolution;
    return ramp;
}

std::int32_t LineListPointCount(const LineGeometry& line, const CPattern& pattern) {
    const std::int64_t total = std::int64_t{pattern.GetLeadInPointCount()} +
                               std::int64_t{LinePassCount(line)} * LinePointCount(line) +
                               pattern.GetPostBlankingPointCount();
    if (total > kMaxListPoints)
        ThrowPitchOutOfRange();
    return static_cast<std::int32_t>(total);
}

void WriteLinePoints(std::span<PatternPoint> points, const LineGeometry& line, const CPattern& pattern) {
    if (points.size() < static_cast<std::size_t>(LineListPointCount(line, pattern)))
        throw std::invalid_argument("Invalid arguments.");
    const LineLayout layout = LayOutLine(line, pattern);
    const DwellRamp ramp = LineDwellRamp(line, layout.count, pattern.GetDwellTimeResolution());

    std::int32_t index = pattern.AddLeadInPoints(points, layout.first, 0);
    index = WriteForwardPass(points, index, layout, ramp, pattern);
    if (LinePassCount(line) == 2)
        index = WriteReturnPass(points, index, layout.count);
    const PatternPoint& last = points[static_cast<std::size_t>(index - 1)];
    pattern.AddPostBlankingPoints(points, {last.x, last.y}, index);
}

} // namespace Norvane::Lumis::Scanning

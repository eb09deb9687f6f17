#include "shapes/rectangle_generator.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

constexpr double kMaxListPoints = std::numeric_limits<std::int32_t>::max();

// Whole steps of size step within length, computed in doubles as the grid is defined.
std::int64_t StepsWithin(std::int32_t length, std::int32_t step) {
    return static_cast<std::int64_t>(std::trunc(static_cast<double>(length) / step));
}

// Points along one axis of a pass: count points from first by step, so that the last one falls on the
// edge where the scan along that axis ends (high for a forward scan, low for a reverse one).
struct AxisWalk {
    double first = 0.0;
    double step = 0.0;
    std::int64_t count = 0;
};

AxisWalk WalkTowardsEnd(std::int32_t low, std::int32_t high, std::int32_t step, std::int64_t count,
                        bool reversed) {
    const double end = reversed ? low : high;
    const double signedStep = reversed ? -step : step;
    return {end - static_cast<double>(count - 1) * signedStep, signedStep, count};
}

ScanOrientation LineOrientation(const RectangularStrategy& strategy) {
    return strategy.orientation == ScanOrientation_Vertical ? ScanOrientation_Vertical
                                                            : ScanOrientation_Horizontal;
}

// Lines of an orientation: rows for horizontal lines, columns for vertical ones.
std::int64_t LineCount(ScanOrientation orientation, const RectangleGrid& grid) {
    return orientation == ScanOrientation_Vertical ? grid.columns : grid.rows;
}

// Dwell change per line in ticks: (End − Begin) / (n − 1) / r, none for a single line.
double DwellStep(const RectangleGeometry& geometry, std::int64_t lines, double resolution) {
    if (lines <= 1)
        return 0.0;
    return (geometry.endDwellTime - geometry.beginDwellTime) / static_cast<double>(lines - 1) / resolution;
}

// Every pass carries its own lead-in and post-blanking; a frame is one pass.
double ListPointTotal(const RectangleGeometry& geometry, const RectangleGrid& grid, const CPattern& pattern) {
    const double framing =
        static_cast<double>(pattern.GetLeadInPointCount()) + pattern.GetPostBlankingPointCount();
    return RectanglePassCount(geometry.strategy) * (framing + RectanglePassPointCount(geometry, grid));
}

DacPosition PositionOf(const PatternPoint& point) {
    return {point.x, point.y};
}

void WriteSolid(std::span<PatternPoint> points, const RectangleGeometry& geometry, const RectangleGrid& grid,
                const CPattern& pattern, std::uint8_t flags) {
    std::int32_t index = 0;
    for (const LinePass& pass : PlanLinePasses(geometry, grid, pattern.GetDwellTimeResolution())) {
        const std::int32_t passStart = index;
        const std::int32_t patternStart = passStart + pattern.GetLeadInPointCount();
        const std::int32_t patternEnd =
            WriteLinePass(points, patternStart, pass, geometry, grid, pattern, flags);
        pattern.AddLeadInPoints(points, PositionOf(points[static_cast<std::size_t>(patternStart)]),
                                passStart);
        index = pattern.AddPostBlankingPoints(
            points, PositionOf(points[static_cast<std::size_t>(patternEnd - 1)]), patternEnd);
    }
}

// The outline clockwise from the top-left corner: top edge, right side, bottom edge, left side, each run
// starting one step beyond the last point of the one before. Every point carries the begin dwell.
void WriteFrame(std::span<PatternPoint> points, const RectangleGeometry& geometry, const RectangleGrid& grid,
                const CPattern& pattern, std::uint8_t flags) {
    const auto segmentsX = static_cast<std::int32_t>(std::max<std::int64_t>(grid.columns - 1, 1));
    const auto segmentsY = static_cast<std::int32_t>(std::max<std::int64_t>(grid.rows - 1, 1));
    const std::uint16_t ticks = ToDwellTicks(geometry.beginDwellTime / pattern.GetDwellTimeResolution());
    const double sx = grid.stepX;
    const double sy = grid.stepY;

    PointRunEnd run{grid.topLeft, pattern.AddLeadInPoints(points, grid.topLeft, 0)};
    run = pattern.AddPoints(points, run.endPosition, {sx, 0.0}, segmentsX, ticks, flags, run.nextIndex);
    run = pattern.AddPoints(points, run.endPosition, {0.0, sy}, segmentsY, ticks, flags, run.nextIndex);
    run = pattern.AddPoints(points, run.endPosition, {-sx, 0.0}, segmentsX, ticks, flags, run.nextIndex);
    run = pattern.AddPoints(points, run.endPosition, {0.0, -sy}, segmentsY, ticks, flags, run.nextIndex);
    pattern.AddPostBlankingPoints(points, PositionOf(points[static_cast<std::size_t>(run.nextIndex - 1)]),
                                  run.nextIndex);
}

} // namespace

RectangleGrid LayOutGrid(const RectangleGeometry& geometry, const CPattern& pattern) {
    const RectangleFloat& area = geometry.rectangle;
    RectangleGrid grid;
    grid.topLeft = pattern.RelativeToDac(area.left, area.top);
    grid.bottomRight = pattern.RelativeToDac(area.right, area.bottom);
    grid.stepX = pattern.RelativeToDacSpanX(geometry.strategy.pitchX);
    grid.stepY = pattern.RelativeToDacSpanY(geometry.strategy.pitchY);
    if (grid.stepX > 0 && grid.stepY > 0) {
        grid.columns = StepsWithin(grid.bottomRight.x - grid.topLeft.x, grid.stepX) + 1;
        grid.rows = StepsWithin(grid.bottomRight.y - grid.topLeft.y, grid.stepY) + 1;
    }
    return grid;
}

bool IsFrameFill(const RectangularStrategy& strategy) {
    return strategy.fillStyle == FillStyle_Frame;
}

std::int32_t RectanglePassCount(const RectangularStrategy& strategy) {
    if (IsFrameFill(strategy))
        return 1;
    switch (strategy.multiPass) {
    case MultiPass_OneOrientation:
        return 2;
    case MultiPass_AllOrientations:
        return 4;
    default:
        return 1;
    }
}

double RectanglePassPointCount(const RectangleGeometry& geometry, const RectangleGrid& grid) {
    const auto columns = static_cast<double>(grid.columns);
    const auto rows = static_cast<double>(grid.rows);
    if (IsFrameFill(geometry.strategy))
        return (std::max(columns - 1.0, 1.0) + std::max(rows - 1.0, 1.0)) * 2.0;
    return columns * rows;
}

std::string RectangleGridProblems(const RectangleGeometry& geometry, const CPattern& pattern) {
    const RectangleGrid grid = LayOutGrid(geometry, pattern);
    std::string problems;
    if (grid.stepX <= 0)
        problems += "PitchX out of range. ";
    if (grid.stepY <= 0)
        problems += "PitchY out of range. ";
    if (problems.empty() && !(ListPointTotal(geometry, grid, pattern) <= kMaxListPoints))
        problems += "Pitch out of range. ";
    return problems;
}

std::int32_t RectangleListPointCount(const RectangleGeometry& geometry, const CPattern& pattern) {
    const std::string problems = RectangleGridProblems(geometry, pattern);
    if (!problems.empty())
        throw std::invalid_argument(problems);
    return static_cast<std::int32_t>(ListPointTotal(geometry, LayOutGrid(geometry, pattern), pattern));
}

double RectangleMeanDwellTime(const RectangleGeometry& geometry) {
    return (geometry.beginDwellTime + geometry.endDwellTime) * 0.5;
}

double RectangleEffectiveLoopTime(const RectangleGeometry& geometry, const CPattern& pattern) {
    return RectanglePassPointCount(geometry, LayOutGrid(geometry, pattern)) *
           RectangleMeanDwellTime(geometry);
}

std::vector<LinePass> PlanLinePasses(const RectangleGeometry& geometry, const RectangleGrid& grid,
                                     double resolution) {
    const double beginTicks = std::trunc(geometry.beginDwellTime / resolution);
    const double endTicks = std::trunc(geometry.endDwellTime / resolution);
    const auto forward = [&](ScanOrientation orientation, bool frameReversed) {
        return LinePass{orientation, frameReversed, beginTicks,
                        DwellStep(geometry, LineCount(orientation, grid), resolution)};
    };
    const auto backward = [&](ScanOrientation orientation) {
        return LinePass{orientation, true, endTicks,
                        -DwellStep(geometry, LineCount(orientation, grid), resolution)};
    };
    const RectangularStrategy& strategy = geometry.strategy;
    const ScanOrientation orientation = LineOrientation(strategy);
    switch (strategy.multiPass) {
    case MultiPass_OneOrientation:
        return {forward(orientation, false), backward(orientation)};
    case MultiPass_AllOrientations:
        return {forward(ScanOrientation_Horizontal, false), backward(ScanOrientation_Horizontal),
                forward(ScanOrientation_Vertical, false), backward(ScanOrientation_Vertical)};
    default:
        return {forward(orientation, strategy.frameDirection == ScanDirection_Reverse)};
    }
}

// Horizontal lines run along X and are stepped in Y; vertical lines run along Y and are stepped in X. The
// line direction reverses the axis along the lines, the frame reversal the axis across them. Serpentine
// order starts each line where the previous one ended and runs it the other way.
std::int32_t WriteLinePass(std::span<PatternPoint> points, std::int32_t firstIndex, const LinePass& pass,
                           const RectangleGeometry& geometry, const RectangleGrid& grid,
                           const CPattern& pattern, std::uint8_t flags) {
    const RectangularStrategy& strategy = geometry.strategy;
    const bool vertical = pass.orientation == ScanOrientation_Vertical;
    const bool lineReversed = strategy.lineDirection == ScanDirection_Reverse;
    const bool serpentine = strategy.scanType == ScanType_Serpentine;
    const AxisWalk walkX = WalkTowardsEnd(grid.topLeft.x, grid.bottomRight.x, grid.stepX, grid.columns,
                                          vertical ? pass.frameReversed : lineReversed);
    const AxisWalk walkY = WalkTowardsEnd(grid.topLeft.y, grid.bottomRight.y, grid.stepY, grid.rows,
                                          vertical ? lineReversed : pass.frameReversed);
    const AxisWalk& along = vertical ? walkY : walkX;
    const AxisWalk& across = vertical ? walkX : walkY;
    const auto pointsPerLine = static_cast<std::int32_t>(along.count);

    double lineStart = along.first;
    double lineStep = along.step;
    double linePosition = across.first;
    std::int32_t index = firstIndex;
    for (std::int64_t line = 0; line < across.count; ++line) {
        const std::uint16_t ticks =
            ToDwellTicks(static_cast<double>(line) * pass.dwellStep + pass.startTicks);
        const DacPosition start = vertical ? DacPosition{TruncToInt32(linePosition), TruncToInt32(lineStart)}
                                           : DacPosition{TruncToInt32(lineStart), TruncToInt32(linePosition)};
        const DacStep step = vertical ? DacStep{0.0, lineStep} : DacStep{lineStep, 0.0};
        index = pattern.AddPoints(points, start, step, pointsPerLine, ticks, flags, index).nextIndex;
        linePosition += across.step;
        if (serpentine) {
            lineStart += static_cast<double>(along.count - 1) * lineStep;
            lineStep = -lineStep;
        }
    }
    return index;
}

void WriteRectanglePoints(std::span<PatternPoint> points, const RectangleGeometry& geometry,
                          const CPattern& pattern, std::uint8_t flags) {
    if (points.size() < static_cast<std::size_t>(RectangleListPointCount(geometry, pattern)))
        throw std::invalid_argument("Invalid arguments.");
    const RectangleGrid grid = LayOutGrid(geometry, pattern);
    if (IsFrameFill(geometry.strategy))
        WriteFrame(points, geometry, grid, pattern, flags);
    else
        WriteSolid(points, geometry, grid, pattern, flags);
}

} // namespace Norvane::Lumis::Scanning

#include "shapes/polygon_generator.h"

#include "module/hresult_exception.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

constexpr std::int64_t kMaxListPoints = std::numeric_limits<std::int32_t>::max();
constexpr const char* kTooFewPoints = "PolygonPatternPointCount < 2";

double AxisSpan(const PatternAlignment& alignment) {
    return static_cast<double>(alignment.range.maximum) - alignment.range.minimum;
}

[[noreturn]] void ThrowUnexpected(const std::string& message) {
    throw HResultException(E_UNEXPECTED, message);
}

bool IsVertical(ScanOrientation orientation) {
    return orientation == ScanOrientation_Vertical;
}

// Vertices with X and Y exchanged for vertical lines, so that lines always run along X.
std::vector<coordinate<double>> AlongLineVertices(const PolygonGeometry& geometry, bool vertical) {
    std::vector<coordinate<double>> result;
    result.reserve(geometry.vertices.size());
    for (const coordinate<double>& vertex : geometry.vertices)
        result.push_back(vertical ? coordinate<double>{vertex.y, vertex.x} : vertex);
    return result;
}

// The crossing rules at vertex i for the line at y: a strict crossing of the edge to the next vertex, or
// the vertex itself when the line meets it.
void AddVertexCrossings(std::span<const coordinate<double>> vertices, std::size_t i, double y, double e,
                        std::vector<LineCrossing>& crossings) {
    const std::size_t count = vertices.size();
    const coordinate<double>& current = vertices[i];
    const coordinate<double>& next = vertices[(i + 1) % count];
    const coordinate<double>& previous = vertices[(i + count - 1) % count];
    if ((next.y + e < y && y < current.y - e) || (current.y + e < y && y < next.y - e)) {
        const double x = current.x + (next.x - current.x) * (y - current.y) / (next.y - current.y);
        crossings.push_back({x, false});
        return;
    }
    if (!(std::abs(y - current.y) <= e))
        return;
    if (std::abs(next.y - current.y) <= e) {
        crossings.push_back({current.x, false});
        crossings.push_back({next.x, false});
        return;
    }
    if (std::abs(previous.y - current.y) < e)
        return;
    const double toNext = next.y - current.y;
    const double toPrevious = previous.y - current.y;
    const bool sameSide = (toNext > e && toPrevious >= e) || (toNext < -e && toPrevious <= -e);
    const bool neighboursOffLine = std::abs(y - next.y) >= e && std::abs(y - previous.y) >= e;
    crossings.push_back({current.x, sameSide && neighboursOffLine});
}

// Line positions across the lines in the order they are written: L = trunc((max - min) / q) + 1 lines one
// pitch apart, the last on max for a forward frame and on min for a reversed one.
std::vector<double> LinePositions(double low, double high, double pitch, bool frameReversed) {
    const auto lines = static_cast<std::int64_t>(std::trunc((high - low) / pitch)) + 1;
    std::vector<double> positions;
    positions.reserve(static_cast<std::size_t>(lines));
    for (std::int64_t k = 0; k < lines; ++k) {
        const double fromEnd = static_cast<double>(lines - 1 - k) * pitch;
        positions.push_back(frameReversed ? low + fromEnd : high - fromEnd);
    }
    return positions;
}

struct AxisGrid {
    double pitchAlong = 0.0;
    double pitchAcross = 0.0;
    std::int32_t dacStepAlong = 0;
    double tolerance = 0.0;
};

AxisGrid GridFor(const PolygonGeometry& geometry, const CPattern& pattern, bool vertical) {
    const RectangularStrategy& s = geometry.strategy;
    if (vertical)
        return {pattern.QuantizeRelativeY(s.pitchY), pattern.QuantizeRelativeX(s.pitchX),
                pattern.RelativeToDacSpanY(s.pitchY), 1.0 / AxisSpan(pattern.GetAlignmentX())};
    return {pattern.QuantizeRelativeX(s.pitchX), pattern.QuantizeRelativeY(s.pitchY),
            pattern.RelativeToDacSpanX(s.pitchX), 1.0 / AxisSpan(pattern.GetAlignmentY())};
}

std::string PitchProblems(const PolygonGeometry& geometry, const CPattern& pattern) {
    std::string problems;
    if (pattern.RelativeToDacSpanX(geometry.strategy.pitchX) <= 0)
        problems += "PitchX out of range. ";
    if (pattern.RelativeToDacSpanY(geometry.strategy.pitchY) <= 0)
        problems += "PitchY out of range. ";
    return problems;
}

bool IsFrameFill(const RectangularStrategy& strategy) {
    return strategy.fillStyle == FillStyle_Frame;
}

// A run along the line at DAC position `across`, from along (DAC) by step, written in (X, Y) order.
PointRun MakeRun(std::int32_t along, std::int32_t across, double step, std::int32_t count, bool vertical) {
    if (vertical)
        return {{across, along}, {0.0, step}, count};
    return {{along, across}, {step, 0.0}, count};
}

std::int32_t ToDacAlong(const CPattern& pattern, double position, double across, bool vertical) {
    return vertical ? pattern.RelativeToDac(across, position).y : pattern.RelativeToDac(position, across).x;
}

std::int32_t ToDacAcross(const CPattern& pattern, double position, bool vertical) {
    return vertical ? pattern.RelativeToDac(position, 0.0).x : pattern.RelativeToDac(0.0, position).y;
}

std::int32_t CheckedCount(double value) {
    if (!(value < static_cast<double>(kMaxListPoints)))
        throw std::invalid_argument("Pitch out of range. ");
    return static_cast<std::int32_t>(value);
}

// One scan line: its spans as runs. Segments run towards increasing position when forward is set;
// serpentine order flips forward after every segment.
PolygonScanLine LayOutLine(std::span<const InsideSpan> spans, const CPattern& pattern, const AxisGrid& grid,
                           double across, bool vertical, bool serpentine, bool& forward) {
    PolygonScanLine line;
    const std::int32_t acrossDac = ToDacAcross(pattern, across, vertical);
    for (const InsideSpan& span : spans) {
        if (span.touching) {
            line.runs.push_back(
                MakeRun(ToDacAlong(pattern, span.from, across, vertical), acrossDac, 0.0, 1, vertical));
            line.pointCount += 1;
            continue;
        }
        const std::int32_t count =
            CheckedCount(std::trunc(std::abs(span.to - span.from) / grid.pitchAlong) + 1.0);
        const std::int32_t right = ToDacAlong(pattern, std::max(span.from, span.to), across, vertical);
        const double step = grid.dacStepAlong;
        if (forward)
            line.runs.push_back(MakeRun(TruncToInt32(right - static_cast<double>(count - 1) * step),
                                        acrossDac, step, count, vertical));
        else
            line.runs.push_back(MakeRun(right, acrossDac, -step, count, vertical));
        line.pointCount += count;
        if (serpentine)
            forward = !forward;
    }
    return line;
}

double DwellStepTicks(const PolygonGeometry& geometry, std::int64_t points, double resolution) {
    if (points <= 1)
        return 0.0;
    return (geometry.endDwellTime - geometry.beginDwellTime) / static_cast<double>(points - 1) / resolution;
}

// Every edge anchored at its end vertex: floor(length / PitchX) points stepping by whole DAC steps to
// exactly the end vertex.
std::vector<DacPosition> LayOutOutline(const PolygonGeometry& geometry, const CPattern& pattern) {
    std::vector<DacPosition> outline;
    const std::vector<coordinate<double>>& v = geometry.vertices;
    const double pitch = geometry.strategy.pitchX;
    double total = 0.0;
    for (std::size_t i = 0; i < v.size(); ++i) {
        const coordinate<double>& from = v[i];
        const coordinate<double>& to = v[(i + 1) % v.size()];
        const double dx = to.x - from.x;
        const double dy = to.y - from.y;
        const double count = std::floor(std::hypot(dx, dy) / pitch);
        total += count;
        CheckedCount(total);
        const double angle = std::atan2(dy, dx);
        const double stepX = pattern.RelativeToDacSpanX(std::cos(angle) * pitch);
        const double stepY = pattern.RelativeToDacSpanY(std::sin(angle) * pitch);
        const DacPosition end = pattern.RelativeToDac(to.x, to.y);
        const auto points = static_cast<std::int32_t>(count);
        for (std::int32_t j = 0; j < points; ++j) {
            const double back = static_cast<double>(points - 1 - j);
            outline.push_back({TruncToInt32(end.x - back * stepX), TruncToInt32(end.y - back * stepY)});
        }
    }
    return outline;
}

std::uint16_t OutlineTicks(const PolygonGeometry& geometry, double resolution, std::size_t index,
                           std::int64_t total) {
    const double begin = std::trunc(geometry.beginDwellTime / resolution);
    return ToDwellTicks(static_cast<double>(index) * DwellStepTicks(geometry, total, resolution) + begin);
}

std::vector<PolygonPass> LayOutFill(const PolygonGeometry& geometry, const CPattern& pattern) {
    std::vector<PolygonPass> passes;
    for (const PolygonPassSetting& setting : PolygonFillPasses(geometry.strategy)) {
        passes.push_back(LayOutPolygonPass(geometry, pattern, setting));
        if (passes.back().pointCount < 2)
            ThrowUnexpected(kTooFewPoints);
    }
    return passes;
}

std::int64_t FramingPoints(const CPattern& pattern) {
    return static_cast<std::int64_t>(pattern.GetLeadInPointCount()) + pattern.GetPostBlankingPointCount();
}

std::vector<DacPosition> CheckedOutline(const PolygonGeometry& geometry, const CPattern& pattern) {
    std::vector<DacPosition> outline = LayOutOutline(geometry, pattern);
    if (outline.size() < 2)
        ThrowUnexpected(kTooFewPoints);
    return outline;
}

void WriteOutline(std::span<PatternPoint> points, const PolygonGeometry& geometry, const CPattern& pattern,
                  std::uint8_t flags) {
    const std::vector<DacPosition> outline = CheckedOutline(geometry, pattern);
    const double resolution = pattern.GetDwellTimeResolution();
    const auto total = static_cast<std::int64_t>(outline.size());
    std::int32_t index = pattern.AddLeadInPoints(points, outline.front(), 0);
    for (std::size_t n = 0; n < outline.size(); ++n)
        index = pattern
                    .AddPoints(points, outline[n], {}, 1, OutlineTicks(geometry, resolution, n, total), flags,
                               index)
                    .nextIndex;
    pattern.AddPostBlankingPoints(points, outline.back(), index);
}

// Every pass: lead-in at its first point, its lines with the dwell stepping once per line by the increment
// of the first pass, post-blanking at its last point.
void WriteFill(std::span<PatternPoint> points, const PolygonGeometry& geometry, const CPattern& pattern,
               std::uint8_t flags) {
    const std::vector<PolygonPass> passes = LayOutFill(geometry, pattern);
    const double resolution = pattern.GetDwellTimeResolution();
    const double beginTicks = std::trunc(geometry.beginDwellTime / resolution);
    const double stepTicks = DwellStepTicks(geometry, passes.front().pointCount, resolution);
    std::int32_t index = 0;
    for (const PolygonPass& pass : passes) {
        const std::int32_t passStart = index;
        index += pattern.GetLeadInPointCount();
        for (std::size_t k = 0; k < pass.lines.size(); ++k) {
            const std::uint16_t ticks = ToDwellTicks(static_cast<double>(k) * stepTicks + beginTicks);
            for (const PointRun& run : pass.lines[k].runs)
                index =
                    pattern.AddPoints(points, run.start, run.step, run.count, ticks, flags, index).nextIndex;
        }
        const PatternPoint& first =
            points[static_cast<std::size_t>(passStart + pattern.GetLeadInPointCount())];
        pattern.AddLeadInPoints(points, {first.x, first.y}, passStart);
        const PatternPoint& last = points[static_cast<std::size_t>(index - 1)];
        index = pattern.AddPostBlankingPoints(points, {last.x, last.y}, index);
    }
}

} // namespace

std::vector<LineCrossing> FindLineCrossings(std::span<const coordinate<double>> vertices, double y,
                                            double tolerance, bool descending) {
    std::vector<LineCrossing> crossings;
    for (std::size_t i = 0; i < vertices.size(); ++i)
        AddVertexCrossings(vertices, i, y, tolerance, crossings);
    std::stable_sort(crossings.begin(), crossings.end(),
                     [descending](const LineCrossing& a, const LineCrossing& b) {
                         return descending ? a.position > b.position : a.position < b.position;
                     });
    return crossings;
}

std::vector<InsideSpan> PairCrossings(std::span<const LineCrossing> crossings) {
    std::vector<InsideSpan> spans;
    std::size_t i = 0;
    while (i < crossings.size()) {
        const LineCrossing& start = crossings[i];
        if (start.touching) {
            spans.push_back({start.position, start.position, true});
            ++i;
            continue;
        }
        std::size_t partner = i + 1;
        if (partner >= crossings.size())
            break;
        if (crossings[partner].touching && partner + 1 < crossings.size())
            ++partner;
        spans.push_back({start.position, crossings[partner].position, false});
        i = partner + 1;
    }
    return spans;
}

std::vector<PolygonPassSetting> PolygonFillPasses(const RectangularStrategy& strategy) {
    const ScanOrientation orientation = strategy.orientation;
    if (orientation != ScanOrientation_Horizontal && orientation != ScanOrientation_Vertical)
        ThrowUnexpected("LineScanOrientation out of range");
    switch (strategy.multiPass) {
    case MultiPass_None:
        return {{orientation, strategy.frameDirection != ScanDirection_Forward}};
    case MultiPass_OneOrientation:
        return {{orientation, false}, {orientation, true}};
    case MultiPass_AllOrientations:
        return {{ScanOrientation_Horizontal, false},
                {ScanOrientation_Horizontal, true},
                {ScanOrientation_Vertical, false},
                {ScanOrientation_Vertical, true}};
    default:
        ThrowUnexpected("MultiPass out of range");
    }
}

std::int32_t PolygonPassCount(const RectangularStrategy& strategy) {
    if (IsFrameFill(strategy))
        return 1;
    switch (strategy.multiPass) {
    case MultiPass_None:
        return 1;
    case MultiPass_OneOrientation:
        return 2;
    case MultiPass_AllOrientations:
        return 4;
    default:
        ThrowUnexpected("MultiPass out of range");
    }
}

PolygonPass LayOutPolygonPass(const PolygonGeometry& geometry, const CPattern& pattern,
                              const PolygonPassSetting& setting) {
    const std::string problems = PitchProblems(geometry, pattern);
    if (!problems.empty())
        throw std::invalid_argument(problems);
    const bool vertical = IsVertical(setting.orientation);
    const std::vector<coordinate<double>> vertices = AlongLineVertices(geometry, vertical);
    const AxisGrid grid = GridFor(geometry, pattern, vertical);
    const auto [low, high] = std::minmax_element(vertices.begin(), vertices.end(),
                                                 [](const auto& a, const auto& b) { return a.y < b.y; });
    const RectangularStrategy& s = geometry.strategy;
    const bool descending = s.lineDirection != ScanDirection_Forward;
    bool forward = !descending;
    PolygonPass pass;
    for (const double across : LinePositions(low->y, high->y, grid.pitchAcross, setting.frameReversed)) {
        const std::vector<LineCrossing> crossings =
            FindLineCrossings(vertices, across, grid.tolerance, descending);
        pass.lines.push_back(LayOutLine(PairCrossings(crossings), pattern, grid, across, vertical,
                                        s.scanType == ScanType_Serpentine, forward));
        pass.pointCount += pass.lines.back().pointCount;
        CheckedCount(static_cast<double>(pass.pointCount));
    }
    return pass;
}

std::string PolygonValidationProblems(const PolygonGeometry& geometry, const CPattern& pattern) {
    const double resolution = pattern.GetDwellTimeResolution();
    std::string problems;
    if (geometry.vertices.size() < 3)
        problems += "Polygon must contain at least 3 points. ";
    if (resolution > geometry.beginDwellTime)
        problems += "BeginDwellTime out of range. ";
    if (resolution > geometry.endDwellTime)
        problems += "EndDwellTime out of range. ";
    if (!IsFrameFill(geometry.strategy))
        problems += PitchProblems(geometry, pattern);
    return problems;
}

std::int32_t PolygonListPointCount(const PolygonGeometry& geometry, const CPattern& pattern) {
    std::int64_t total = 0;
    if (IsFrameFill(geometry.strategy)) {
        total = static_cast<std::int64_t>(CheckedOutline(geometry, pattern).size()) + FramingPoints(pattern);
    } else {
        for (const PolygonPass& pass : LayOutFill(geometry, pattern))
            total += pass.pointCount + FramingPoints(pattern);
    }
    return CheckedCount(static_cast<double>(total));
}

void WritePolygonPoints(std::span<PatternPoint> points, const PolygonGeometry& geometry,
                        const CPattern& pattern, std::uint8_t flags) {
    if (points.size() < static_cast<std::size_t>(PolygonListPointCount(geometry, pattern)))
        throw std::invalid_argument("Invalid arguments.");
    if (IsFrameFill(geometry.strategy))
        WriteOutline(points, geometry, pattern, flags);
    else
        WriteFill(points, geometry, pattern, flags);
}

// Outline: the rendered dwell of every point. Solid: one pass in the stored orientation and frame
// direction, the dwell stepping per line counted from the low edge of the bounding box.
double PolygonEffectiveLoopTime(const PolygonGeometry& geometry, const CPattern& pattern) {
    const double r = pattern.GetDwellTimeResolution();
    const RectangularStrategy& s = geometry.strategy;
    if (IsFrameFill(s)) {
        const std::vector<DacPosition> outline = CheckedOutline(geometry, pattern);
        double time = 0.0;
        for (std::size_t n = 0; n < outline.size(); ++n)
            time += OutlineTicks(geometry, r, n, static_cast<std::int64_t>(outline.size())) * r;
        return time;
    }
    if (s.fillStyle != FillStyle_Solid)
        ThrowUnexpected("FillStyle out of range");
    const std::vector<PolygonPassSetting> settings =
        PolygonFillPasses({s.pitchX, s.pitchY, s.orientation, s.lineDirection, s.frameDirection, s.fillStyle,
                           s.scanType, MultiPass_None});
    PolygonPass pass = LayOutPolygonPass(geometry, pattern, settings.front());
    if (pass.pointCount < 2)
        ThrowUnexpected(kTooFewPoints);
    if (settings.front().frameReversed)
        std::reverse(pass.lines.begin(), pass.lines.end());
    const double delta =
        (geometry.endDwellTime - geometry.beginDwellTime) / static_cast<double>(pass.pointCount - 1);
    double time = 0.0;
    for (std::size_t k = 0; k < pass.lines.size(); ++k)
        time += static_cast<double>(pass.lines[k].pointCount) *
                std::floor((geometry.beginDwellTime + static_cast<double>(k) * delta) / r) * r;
    return time;
}

double PolygonMeanDwellTime(const PolygonGeometry& geometry) {
    return (geometry.beginDwellTime + geometry.endDwellTime) * 0.5;
}

} // namespace Norvane::Lumis::Scanning

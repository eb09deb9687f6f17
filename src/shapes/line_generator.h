// Point generation of the line pattern: plain values in, point records out.
//
// A line is a row of N = trunc(L / pitch) + 1 points that ends exactly on its anchor (the end point, or
// the begin point when scanning in reverse). The DAC step is truncated once and reused, so rounding and
// the part of L that is not a whole pitch fall before the first point. The dwell runs linearly from the
// begin to the end dwell time over the points of a pass; a return pass visits the same points backwards.
#pragma once

#include "core/pattern_base.h"
#include "module/geometry_values.h"

#include <beamweaver/dwellmap.h>
#include <beamweaver/enums.h>

#include <cstdint>
#include <span>

namespace Norvane::Lumis::Scanning {

// The line's own properties; defaults are those of a new line pattern.
struct LineGeometry {
    coordinate<double> begin{0.0, 0.0};
    coordinate<double> end{1.0, 1.0};
    double beginDwellTime = 1e-6;
    double endDwellTime = 1e-6;
    double pitch = 0.1;
    ScanDirection scanDirection = ScanDirection_Forward;
    MultiPass multiPass = MultiPass_None;
};

// Where the points of one pass lie in DAC units: count points from first to anchor by step.
struct LineLayout {
    std::int32_t count = 0;
    DacStep step;
    DacPosition anchor;
    DacPosition first;
};

// Dwell ticks along a pass: trunc(index * increment + first), where first is already whole.
struct DwellRamp {
    double first = 0.0;
    double increment = 0.0;

    // Held within the 16-bit dwell field instead of wrapping.
    std::uint16_t TicksAt(std::int32_t index) const;
};

// trunc(L / pitch) + 1. A pitch so fine that one pass would not fit into a point list (2147483647
// points) throws std::invalid_argument "Pitch out of range. ".
std::int32_t LinePointCount(const LineGeometry& line);
// 2 with a return pass (MultiPass_OneOrientation), else 1.
std::int32_t LinePassCount(const LineGeometry& line);
// (BeginDwellTime + EndDwellTime) / 2: the mean dwell of a point.
double LineMeanDwellTime(const LineGeometry& line);
// N × mean dwell: the time of one pass from the unquantised dwell times.
double LineEffectiveLoopTime(const LineGeometry& line);

// Steps from the pitch along the line's angle, anchor and first point in the pattern's DAC units.
LineLayout LayOutLine(const LineGeometry& line, const CPattern& pattern);
// The ramp in ticks of resolution for a pass of count points (no increment for a single point).
DwellRamp LineDwellRamp(const LineGeometry& line, std::int32_t count, double resolution);

// Lead-in + passes × N + post-blanking: the size of the whole list. A total beyond what a point list holds
// throws std::invalid_argument "Pitch out of range. ".
std::int32_t LineListPointCount(const LineGeometry& line, const CPattern& pattern);

// Writes the whole list (which holds LineListPointCount points): lead-in at the first point, the forward
// pass with the acquire flag, the return pass when there is one, and post-blanking at the last point
// written. Coordinates go through the pattern's writer, which keeps them within the DAC range.
void WriteLinePoints(std::span<PatternPoint> points, const LineGeometry& line, const CPattern& pattern);

} // namespace Norvane::Lumis::Scanning

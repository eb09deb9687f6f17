// Point generation of the rectangle pattern: plain values in, point records out.
//
// The rectangle is laid out on a grid of whole DAC steps: sx = trunc(span × PitchX) and likewise sy,
// kx = trunc((X2 − X1) / sx) and ky = trunc((Y2 − Y1) / sy) steps, so nx = kx + 1 points per row and
// ny = ky + 1 rows. The grid is anchored at the edges where the scan ends; whatever of the width or height
// is not a whole pitch stays unscanned on the side where the scan starts. A solid fill writes the grid
// row by row (or column by column) with the dwell ramping linearly over the lines, once per pass; a frame
// fill writes only the outline at the begin dwell.
#pragma once

#include "core/pattern_base.h"
#include "core/scan_strategy_values.h"
#include "module/geometry_values.h"

#include <beamweaver/dwellmap.h>

#include <cstdint>
#include <span>
#include <string>
#include <vector>

namespace Norvane::Lumis::Scanning {

// The rectangle's own properties; defaults are those of a new rectangle pattern.
struct RectangleGeometry {
    RectangleFloat rectangle{0.0, 0.0, 1.0, 1.0};
    double beginDwellTime = 1e-6;
    double endDwellTime = 1e-6;
    RectangularStrategy strategy;
};

// The grid in DAC units: corners (X1, Y1) and (X2, Y2), steps sx and sy, and the points per row (nx) and
// rows (ny). Counts are 0 when a step is not at least one DAC unit.
struct RectangleGrid {
    DacPosition topLeft;
    DacPosition bottomRight;
    std::int32_t stepX = 0;
    std::int32_t stepY = 0;
    std::int64_t columns = 0;
    std::int64_t rows = 0;
};

// One pass of lines: their orientation, whether the frame runs from the far edge back (reversed), the
// dwell of the first line in ticks and the change per line.
struct LinePass {
    ScanOrientation orientation = ScanOrientation_Horizontal;
    bool frameReversed = false;
    double startTicks = 0.0;
    double dwellStep = 0.0;
};

RectangleGrid LayOutGrid(const RectangleGeometry& geometry, const CPattern& pattern);

// Whether the outline is written (FillStyle_Frame); every other value fills the area.
bool IsFrameFill(const RectangularStrategy& strategy);
// Passes of a solid fill: 2 for MultiPass_OneOrientation, 4 for MultiPass_AllOrientations, else 1.
// A frame is always one pass.
std::int32_t RectanglePassCount(const RectangularStrategy& strategy);

// Points of one pass without lead-in or post-blanking: nx × ny for a solid fill,
// (max(kx, 1) + max(ky, 1)) × 2 for a frame. A double, so that no grid overflows it; exact for every grid
// that passes RectangleGridProblems.
double RectanglePassPointCount(const RectangleGeometry& geometry, const RectangleGrid& grid);

// What keeps the grid from being rendered, as validation text: "PitchX out of range. " and/or
// "PitchY out of range. " for a pitch below one DAC step, "Pitch out of range. " for a point list that
// would hold more than 2147483647 points. Empty when it can be rendered.
std::string RectangleGridProblems(const RectangleGeometry& geometry, const CPattern& pattern);

// Lead-in + passes × (pattern points) + post-blanking for a solid fill (lead-in and post-blanking in every
// pass), lead-in + outline + post-blanking for a frame. Throws std::invalid_argument with the grid
// problems when the grid cannot be rendered.
std::int32_t RectangleListPointCount(const RectangleGeometry& geometry, const CPattern& pattern);

// (BeginDwellTime + EndDwellTime) / 2: the mean dwell of a point.
double RectangleMeanDwellTime(const RectangleGeometry& geometry);
// Points of one pass × mean dwell, from the unquantised dwell times.
double RectangleEffectiveLoopTime(const RectangleGeometry& geometry, const CPattern& pattern);

// The passes of a solid fill in the order they are written, with their dwell ramps in ticks of
// resolution.
std::vector<LinePass> PlanLinePasses(const RectangleGeometry& geometry, const RectangleGrid& grid,
                                     double resolution);

// Writes one pass of lines at points[firstIndex, firstIndex + nx × ny), one run per line, every point of a
// line with the same dwell and the given flags. Returns the next free index.
std::int32_t WriteLinePass(std::span<PatternPoint> points, std::int32_t firstIndex, const LinePass& pass,
                           const RectangleGeometry& geometry, const RectangleGrid& grid,
                           const CPattern& pattern, std::uint8_t flags);

// Writes the whole list (which holds RectangleListPointCount points): for each pass its lead-in at the
// pass's first point, its pattern points, and its post-blanking at its last point; or the outline framed
// the same way. Pattern points carry flags (the acquire flag, or the blank flag for an exclusion).
void WriteRectanglePoints(std::span<PatternPoint> points, const RectangleGeometry& geometry,
                          const CPattern& pattern, std::uint8_t flags);

} // namespace Norvane::Lumis::Scanning

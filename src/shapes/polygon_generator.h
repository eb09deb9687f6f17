// Point generation of the polygon pattern: plain values in, point records out.
//
// A solid fill cuts scan lines with the closed outline. Lines are described here for horizontal
// orientation (lines along X, stacked along Y); vertical orientation exchanges X and Y throughout, pitches
// and DAC ranges included. The lines lie one quantised pitch apart, anchored on the edge of the bounding
// box where the frame ends. Each line's crossings with the outline, found within a tolerance of one DAC
// step, are sorted along the line and paired into inside segments; a vertex whose neighbours both lie on
// the same side of the line only touches it and yields a single point. Every segment is a run of points
// on a DAC grid anchored at its right end. The outline fill instead draws every edge as a row of points
// ending exactly on the edge's end vertex.
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

// The polygon's own properties; defaults are those of a new polygon pattern.
struct PolygonGeometry {
    std::vector<coordinate<double>> vertices;
    double beginDwellTime = 1e-6;
    double endDwellTime = 1e-6;
    RectangularStrategy strategy;
};

// Where a scan line meets the outline: the position along the line, and whether a vertex only touches it.
struct LineCrossing {
    double position = 0.0;
    bool touching = false;
};

// A piece of a scan line inside the polygon, from one crossing to the next in scan order; a touching
// vertex is a piece whose ends coincide.
struct InsideSpan {
    double from = 0.0;
    double to = 0.0;
    bool touching = false;
};

// A row of points on one scan line.
struct PointRun {
    DacPosition start;
    DacStep step;
    std::int32_t count = 0;
};

// The runs of one scan line in the order they are written.
struct PolygonScanLine {
    std::vector<PointRun> runs;
    std::int64_t pointCount = 0;
};

// One fill pass: its lines in the order they are written.
struct PolygonPass {
    std::vector<PolygonScanLine> lines;
    std::int64_t pointCount = 0;
};

// Orientation and frame direction of one fill pass.
struct PolygonPassSetting {
    ScanOrientation orientation = ScanOrientation_Horizontal;
    bool frameReversed = false;
};

// Crossings of the horizontal line at y with the closed outline through vertices, with the tolerance,
// sorted by X (ascending, or descending when descending is set) keeping equal positions in the order found.
std::vector<LineCrossing> FindLineCrossings(std::span<const coordinate<double>> vertices, double y,
                                            double tolerance, bool descending);

// Pairs sorted crossings into inside spans: a touching vertex stands alone; an ordinary crossing pairs with
// the next one, passing over a touching vertex directly after it when another crossing follows that.
std::vector<InsideSpan> PairCrossings(std::span<const LineCrossing> crossings);

// The passes of a solid fill in the order they are written. An orientation other than horizontal or
// vertical, or an unknown MultiPass, throws E_UNEXPECTED.
std::vector<PolygonPassSetting> PolygonFillPasses(const RectangularStrategy& strategy);

// Passes that GetLoopTime counts: 1 for the outline and for MultiPass_None, 2 for MultiPass_OneOrientation,
// 4 for MultiPass_AllOrientations; any other MultiPass throws E_UNEXPECTED.
std::int32_t PolygonPassCount(const RectangularStrategy& strategy);

// Lays out one fill pass. Throws std::invalid_argument "PitchX out of range. " / "PitchY out of range. "
// when a pitch is below one DAC step.
PolygonPass LayOutPolygonPass(const PolygonGeometry& geometry, const CPattern& pattern,
                              const PolygonPassSetting& setting);

// What keeps the polygon from being rendered, as validation text: fewer than three vertices, dwell times
// finer than the resolution, pitches below one DAC step.
std::string PolygonValidationProblems(const PolygonGeometry& geometry, const CPattern& pattern);

// Lead-in, pattern points and post-blanking of every pass (or of the outline). Throws E_UNEXPECTED
// "PolygonPatternPointCount < 2" for a pass of fewer than two points and std::invalid_argument
// "Pitch out of range. " for a list beyond 2147483647 points.
std::int32_t PolygonListPointCount(const PolygonGeometry& geometry, const CPattern& pattern);

// Writes the whole list (which holds PolygonListPointCount points). Pattern points carry flags.
void WritePolygonPoints(std::span<PatternPoint> points, const PolygonGeometry& geometry,
                        const CPattern& pattern, std::uint8_t flags);

// Time of one pass without blanking, from the quantised dwell of every point.
double PolygonEffectiveLoopTime(const PolygonGeometry& geometry, const CPattern& pattern);

// (BeginDwellTime + EndDwellTime) / 2.
double PolygonMeanDwellTime(const PolygonGeometry& geometry);

} // namespace Norvane::Lumis::Scanning

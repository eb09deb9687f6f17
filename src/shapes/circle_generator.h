// Point generation of the circle pattern: plain values in, point records out.
//
// A ring of radius ρ and tangential pitch p is divided into the whole number of equal angles nearest to
// 2π/θ, θ being the angle of a chord of length p; it does not exist when p exceeds the diameter. The
// circular modes write rings inner to outer, outer to inner, both, or only the outer rim (frame); the
// rectangular mode writes horizontal serpentine lines over the disc, jumping blanked across the hole.
#pragma once

#include "core/pattern_base.h"
#include "core/scan_strategy_values.h"
#include "module/geometry_values.h"

#include <beamweaver/dwellmap.h>

#include <cstdint>
#include <optional>
#include <span>
#include <string>

namespace Norvane::Lumis::Scanning {

// The circle's own properties; defaults are those of a new circle pattern. circularKind tells which
// strategy is in force; fillStyle and multiPass are those of the last accepted strategy.
// A circle's rectangular strategy starts as serpentine lines.
constexpr RectangularStrategy DefaultCircleRectangularStrategy() {
    RectangularStrategy strategy;
    strategy.scanType = ScanType_Serpentine;
    return strategy;
}

struct CircleGeometry {
    coordinate<double> center{0.5, 0.5};
    double innerRadius = 0.0;
    double outerRadius = 0.5;
    double innerDwellTime = 1e-6;
    double outerDwellTime = 1e-6;
    double innerCircleBlankingTime = 1e-6;
    CircularStrategy circular;
    RectangularStrategy rectangular = DefaultCircleRectangularStrategy();
    bool circularKind = true;
    FillStyle fillStyle = FillStyle_Solid;
    MultiPass multiPass = MultiPass_None;
};

enum class CircleMode { Frame, BothPasses, OuterToInner, InnerToOuter, Rectangular };

// The mode of the strategy in force, or nothing for a combination no mode serves (a frame under the
// rectangular kind, an unknown fill style, multi-pass or scan type).
std::optional<CircleMode> FindCircleMode(const CircleGeometry& geometry);
// The same, throwing E_UNEXPECTED where no mode serves.
CircleMode ChooseCircleMode(const CircleGeometry& geometry);

// The angle between neighbouring points of a ring, or nothing when the pitch exceeds the diameter.
std::optional<double> RingAngularStep(double pitch, double radius);

// floor((Outer − Inner + 0.001·PitchR) / PitchR) + 1, at least 1, as a double so that no pitch overflows it.
double CircleRingCount(const CircleGeometry& geometry);

// Points the mode writes, without lead-in or post-blanking; a double so that nothing overflows it. A frame
// whose ring does not exist, or a combination without a mode, counts 0 (its render fails).
double CircleModePointCount(const CircleGeometry& geometry, const CPattern& pattern);

// Lead-in + mode points + post-blanking; throws std::invalid_argument "Pitch out of range. " when the list
// would hold more than 2147483647 points.
std::int32_t CircleListPointCount(const CircleGeometry& geometry, const CPattern& pattern);

// "Pitch out of range. " when the list would hold more than 2147483647 points, else empty.
std::string CircleCountProblems(const CircleGeometry& geometry, const CPattern& pattern);

// Writes the whole list (CircleListPointCount points): lead-in at the mode's pre-blanking position, the
// mode's points with flags, post-blanking at the last point written. A frame ring that does not exist
// throws E_INVALIDARG.
void WriteCirclePoints(std::span<PatternPoint> points, const CircleGeometry& geometry,
                       const CPattern& pattern, std::uint8_t flags);

// Time of one pass from the unquantised dwell times (see the pattern's GetEffectiveLoopTime); throws
// E_UNEXPECTED for a combination without a loop time and E_INVALIDARG for a frame ring that does not exist.
double CircleEffectiveLoopTime(const CircleGeometry& geometry, const CPattern& pattern);

// Points of an inner-circle blanking group of total time T: none when T < r, else k = 1 + the halvings of
// T until T ≤ M, raised to ceil(T / M) where T / k would still exceed M.
double BlankingGroupPointCount(double total, double resolution, double maxPointDwell);

} // namespace Norvane::Lumis::Scanning

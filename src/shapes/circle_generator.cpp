#include "shapes/circle_generator.h"

#include "module/hresult_exception.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

constexpr double kTwoPi = 6.283185307179586;
constexpr double kMaxListPoints = std::numeric_limits<std::int32_t>::max();

// Points of a ring in a pass: the full ring when its radius is at least 0.95 PitchR and its step exists,
// else the single centre point.
double PassRingPointCount(double radius, const CircularStrategy& strategy) {
    if (!(radius >= 0.95 * strategy.pitchR))
        return 1.0;
    const std::optional<double> step = RingAngularStep(strategy.pitchT, radius);
    return step ? 1.0 + std::trunc(kTwoPi / *step) : 1.0;
}

double FramePointCount(double step) {
    const double count = std::trunc(kTwoPi / step);
    return count < 2.0 ? 1.0 : count;
}

double FrameStepOrThrow(const CircleGeometry& geometry) {
    const std::optional<double> step = RingAngularStep(geometry.circular.pitchT, geometry.outerRadius);
    if (!step)
        throw HResultException(E_INVALIDARG, "PitchT exceeds the diameter of the circle");
    return *step;
}

// Radius of ring j of a pass: anchored at the outer radius scanning outward, at the inner one inward.
double PassRadius(const CircleGeometry& geometry, bool outward, double rings, double j) {
    const double fromAnchor = (rings - 1.0 - j) * geometry.circular.pitchR;
    return outward ? geometry.outerRadius - fromAnchor : geometry.innerRadius + fromAnchor;
}

double PassPointCount(const CircleGeometry& geometry, bool outward) {
    const double rings = CircleRingCount(geometry);
    double total = 0.0;
    for (double j = 0.0; j < rings && total <= kMaxListPoints; j += 1.0)
        total += PassRingPointCount(PassRadius(geometry, outward, rings, j), geometry.circular);
    return total;
}

// Dwell at distance rho in seconds, linear between the radii; a zero-width annulus has the inner dwell.
double RectangularDwellTime(const CircleGeometry& geometry, double rho) {
    const double width = geometry.outerRadius - geometry.innerRadius;
    if (width == 0.0)
        return geometry.innerDwellTime;
    return (rho - geometry.innerRadius) * (geometry.outerDwellTime - geometry.innerDwellTime) / width +
           geometry.innerDwellTime;
}

// Half the chord at distance |y| from the centre of a circle of the given radius (0 outside it).
double HalfChord(double radius, double y) {
    if (!(radius > 0.0))
        return 0.0;
    return radius * std::sin(std::acos(std::min(std::abs(y) / radius, 1.0)));
}

// One serpentine line of the rectangular mode, in offsets from the centre.
struct SerpentineLine {
    double y = 0.0;
    double firstX = 0.0;
    double step = 0.0;
    double positions = 0.0; // 1 + trunc(2w / PitchX)
    bool crossesHole = false;
    double partPoints = 0.0; // m + 1 (at least 0) points on each side of the hole
};

double SerpentineLineCount(const CircleGeometry& geometry) {
    return 1.0 + std::trunc(2.0 * geometry.outerRadius / geometry.rectangular.pitchY);
}

SerpentineLine PlanSerpentineLine(const CircleGeometry& geometry, double k) {
    const RectangularStrategy& strategy = geometry.rectangular;
    SerpentineLine line;
    line.y = -geometry.outerRadius + k * strategy.pitchY;
    const double halfChord = HalfChord(geometry.outerRadius, line.y);
    const double steps = std::trunc(2.0 * halfChord / strategy.pitchX);
    const bool forward = std::fmod(k, 2.0) == 0.0;
    line.step = forward ? strategy.pitchX : -strategy.pitchX;
    line.firstX = -line.step / 2.0 * steps;
    line.positions = steps + 1.0;
    line.crossesHole = std::abs(line.y) < geometry.innerRadius;
    if (line.crossesHole) {
        const double holeChord = HalfChord(geometry.innerRadius, line.y);
        line.partPoints = std::max(std::trunc((halfChord - holeChord) / strategy.pitchX) + 1.0, 0.0);
    }
    return line;
}

double SerpentinePointCount(const CircleGeometry& geometry, const CPattern& pattern) {
    const double lines = SerpentineLineCount(geometry);
    const double group = BlankingGroupPointCount(
        geometry.innerCircleBlankingTime, pattern.GetDwellTimeResolution(), pattern.GetMaxPointDwellTime());
    double total = 0.0;
    for (double k = 0.0; k < lines && total <= kMaxListPoints; k += 1.0) {
        const SerpentineLine line = PlanSerpentineLine(geometry, k);
        total += line.crossesHole ? 2.0 * (line.partPoints + group) : line.positions;
    }
    return total;
}

// Writes points into a span through the pattern's DAC conversion, advancing an index.
class CircleWriter {
  public:
    CircleWriter(std::span<PatternPoint> points, const CircleGeometry& geometry, const CPattern& pattern,
                 std::uint8_t flags, std::int32_t index)
        : points_(points), geometry_(geometry), pattern_(pattern), flags_(flags), index_(index) {}

    std::int32_t Index() const { return index_; }
    DacPosition Last() const { return last_; }

    // count points around the ring through start, the angle decreasing by step from point to point.
    void WriteRing(coordinate<double> start, double step, double count, std::uint16_t ticks) {
        const coordinate<double>& c = geometry_.center;
        const double radius = std::hypot(start.x - c.x, start.y - c.y);
        const double startAngle = std::atan2(start.y - c.y, start.x - c.x);
        for (double i = 0.0; i < count; i += 1.0) {
            const double angle = startAngle - i * step;
            WriteAt({c.x + radius * std::cos(angle), c.y + radius * std::sin(angle)}, ticks, flags_);
        }
    }

    void WriteAt(coordinate<double> relative, std::uint16_t ticks, std::uint8_t flags) {
        last_ = pattern_.RelativeToDac(relative.x, relative.y);
        StorePoint(&points_[static_cast<std::size_t>(index_)],
                   MakePoint(ClampToDac(last_.x), ClampToDac(last_.y), ticks, flags));
        ++index_;
    }

    // count blanked points at one position, each with the same dwell.
    void WriteGroup(coordinate<double> relative, std::int32_t count, std::uint16_t ticks) {
        if (count == 0)
            return;
        last_ = pattern_.RelativeToDac(relative.x, relative.y);
        index_ =
            pattern_.AddPoints(points_, last_, DacStep{}, count, ticks, PointFlag_Blank, index_).nextIndex;
    }

  private:
    std::span<PatternPoint> points_;
    const CircleGeometry& geometry_;
    const CPattern& pattern_;
    std::uint8_t flags_;
    std::int32_t index_;
    DacPosition last_;
};

void WriteFrame(CircleWriter& writer, const CircleGeometry& geometry, const CPattern& pattern) {
    const double step = FrameStepOrThrow(geometry);
    const double r = pattern.GetDwellTimeResolution();
    const std::uint16_t ticks =
        ToDwellTicks(std::min(geometry.outerDwellTime, pattern.GetMaxPointDwellTime()) / r);
    writer.WriteRing({geometry.center.x + geometry.outerRadius, geometry.center.y}, step,
                     FramePointCount(step), ticks);
}

void WritePass(CircleWriter& writer, const CircleGeometry& geometry, const CPattern& pattern, bool outward,
               std::uint8_t flags) {
    const double r = pattern.GetDwellTimeResolution();
    const double rings = CircleRingCount(geometry);
    const double increment =
        rings > 1.0 ? std::trunc((geometry.outerDwellTime - geometry.innerDwellTime) / (rings - 1.0) / r)
                    : 0.0;
    const double firstTicks = std::trunc((outward ? geometry.innerDwellTime : geometry.outerDwellTime) / r);
    const double signedIncrement = outward ? increment : -increment;
    const coordinate<double>& c = geometry.center;
    for (double j = 0.0; j < rings; j += 1.0) {
        const double radius = PassRadius(geometry, outward, rings, j);
        const std::uint16_t ticks = ToDwellTicks(firstTicks + j * signedIncrement);
        const std::optional<double> step = RingAngularStep(geometry.circular.pitchT, radius);
        if (!(radius >= 0.95 * geometry.circular.pitchR) || !step) {
            writer.WriteAt(c, ticks, flags);
            continue;
        }
        const double half = std::fmod(j, 2.0) == 0.0 ? 0.5 : -0.5;
        const coordinate<double> start{c.x + radius * std::cos(half * *step),
                                       c.y + radius * std::sin(half * *step)};
        writer.WriteRing(start, *step, 1.0 + std::trunc(kTwoPi / *step), ticks);
    }
}

void WriteSerpentine(CircleWriter& writer, const CircleGeometry& geometry, const CPattern& pattern,
                     std::uint8_t flags) {
    const double r = pattern.GetDwellTimeResolution();
    const double blanking = geometry.innerCircleBlankingTime;
    const auto groupCount =
        static_cast<std::int32_t>(BlankingGroupPointCount(blanking, r, pattern.GetMaxPointDwellTime()));
    const std::uint16_t groupTicks = groupCount > 0 ? ToDwellTicks(std::trunc(blanking / groupCount / r)) : 0;
    const coordinate<double>& c = geometry.center;
    const auto writeRun = [&](const SerpentineLine& line, double firstX, double count) {
        for (double i = 0.0; i < count; i += 1.0) {
            const double x = firstX + i * line.step;
            writer.WriteAt(
                {c.x + x, c.y + line.y},
                ToDwellTicks(std::trunc(RectangularDwellTime(geometry, std::hypot(x, line.y)) / r)), flags);
        }
    };
    const double lines = SerpentineLineCount(geometry);
    for (double k = 0.0; k < lines; k += 1.0) {
        const SerpentineLine line = PlanSerpentineLine(geometry, k);
        if (!line.crossesHole) {
            writeRun(line, line.firstX, line.positions);
            continue;
        }
        const double farStart = -line.firstX - (line.partPoints - 1.0) * line.step;
        writeRun(line, line.firstX, line.partPoints);
        writer.WriteGroup({c.x + line.firstX + line.partPoints * line.step, c.y + line.y}, groupCount,
                          groupTicks);
        writer.WriteGroup({c.x + farStart, c.y + line.y}, groupCount, groupTicks);
        writeRun(line, farStart, line.partPoints);
    }
}

// Radial DAC steps of PitchR from the anchor, for the pre-blanking positions of the passes.
std::int32_t RadialOffset(const CircleGeometry& geometry, const CPattern& pattern) {
    return TruncToInt32((CircleRingCount(geometry) - 1.0) *
                        pattern.RelativeToDacSpanX(geometry.circular.pitchR));
}

DacPosition InnerStart(const CircleGeometry& geometry, const CPattern& pattern) {
    const coordinate<double>& c = geometry.center;
    if (geometry.innerRadius >= geometry.circular.pitchR &&
        2.0 * geometry.innerRadius >= geometry.circular.pitchT) {
        const DacPosition rim = pattern.RelativeToDac(c.x + geometry.outerRadius, c.y);
        return {rim.x - RadialOffset(geometry, pattern), rim.y};
    }
    return pattern.RelativeToDac(c.x, c.y);
}

DacPosition PreBlankingPosition(CircleMode mode, const CircleGeometry& geometry, const CPattern& pattern) {
    const coordinate<double>& c = geometry.center;
    switch (mode) {
    case CircleMode::Frame:
        return pattern.RelativeToDac(c.x + geometry.outerRadius, c.y);
    case CircleMode::OuterToInner: {
        const DacPosition inner = pattern.RelativeToDac(c.x + geometry.innerRadius, c.y);
        return {inner.x + RadialOffset(geometry, pattern), inner.y};
    }
    case CircleMode::Rectangular:
        return pattern.RelativeToDac(c.x, c.y - geometry.outerRadius);
    case CircleMode::BothPasses:
    case CircleMode::InnerToOuter:
        break;
    }
    return InnerStart(geometry, pattern);
}

void WriteMode(CircleMode mode, CircleWriter& writer, const CircleGeometry& geometry, const CPattern& pattern,
               std::uint8_t flags) {
    switch (mode) {
    case CircleMode::Frame:
        WriteFrame(writer, geometry, pattern);
        return;
    case CircleMode::BothPasses:
        WritePass(writer, geometry, pattern, true, flags);
        WritePass(writer, geometry, pattern, false, flags);
        return;
    case CircleMode::OuterToInner:
        WritePass(writer, geometry, pattern, false, flags);
        return;
    case CircleMode::InnerToOuter:
        WritePass(writer, geometry, pattern, true, flags);
        return;
    case CircleMode::Rectangular:
        WriteSerpentine(writer, geometry, pattern, flags);
        return;
    }
}

// Σ dwell × ring points over the rings of a pass, dwell linear from the anchor's dwell time by Δ per ring.
double PassLoopTime(const CircleGeometry& geometry, bool outward) {
    const double rings = CircleRingCount(geometry);
    const double delta =
        rings > 1.0 ? (geometry.outerDwellTime - geometry.innerDwellTime) / (rings - 1.0) : 0.0;
    double total = 0.0;
    for (double k = 0.0; k < rings; k += 1.0) {
        const double radius = outward ? geometry.outerRadius - k * geometry.circular.pitchR
                                      : geometry.innerRadius + k * geometry.circular.pitchR;
        const double dwell =
            outward ? geometry.outerDwellTime - k * delta : geometry.innerDwellTime + k * delta;
        total += dwell * PassRingPointCount(radius, geometry.circular);
    }
    return total;
}

double SerpentineLoopTime(const CircleGeometry& geometry, const CPattern& pattern) {
    const double r = pattern.GetDwellTimeResolution();
    const double blankingTicks = std::floor(geometry.innerCircleBlankingTime / r);
    double ticks = 0.0;
    const auto addRun = [&](const SerpentineLine& line, double firstX, double count) {
        for (double i = 0.0; i < count; i += 1.0)
            ticks +=
                std::floor(RectangularDwellTime(geometry, std::hypot(firstX + i * line.step, line.y)) / r);
    };
    const double lines = SerpentineLineCount(geometry);
    for (double k = 0.0; k < lines; k += 1.0) {
        const SerpentineLine line = PlanSerpentineLine(geometry, k);
        if (!line.crossesHole) {
            addRun(line, line.firstX, line.positions);
            continue;
        }
        addRun(line, line.firstX, line.partPoints);
        addRun(line, -line.firstX - (line.partPoints - 1.0) * line.step, line.partPoints);
        ticks += 2.0 * blankingTicks;
    }
    return r * ticks;
}

} // namespace

std::optional<CircleMode> FindCircleMode(const CircleGeometry& geometry) {
    if (geometry.fillStyle == FillStyle_Frame && geometry.circularKind)
        return CircleMode::Frame;
    if (geometry.fillStyle == FillStyle_Solid && !geometry.circularKind)
        return CircleMode::Rectangular;
    if (geometry.fillStyle != FillStyle_Solid)
        return std::nullopt;
    if (geometry.multiPass == MultiPass_OneOrientation)
        return CircleMode::BothPasses;
    if (geometry.multiPass == MultiPass_None && geometry.circular.scanType == CircleScanType_OuterToInner)
        return CircleMode::OuterToInner;
    if (geometry.multiPass == MultiPass_None && geometry.circular.scanType == CircleScanType_InnerToOuter)
        return CircleMode::InnerToOuter;
    return std::nullopt;
}

CircleMode ChooseCircleMode(const CircleGeometry& geometry) {
    if (const std::optional<CircleMode> mode = FindCircleMode(geometry))
        return *mode;
    throw HResultException(E_UNEXPECTED);
}

std::optional<double> RingAngularStep(double pitch, double radius) {
    if (pitch > 2.0 * radius)
        return std::nullopt;
    const double theta = 2.0 * std::asin(pitch / (2.0 * radius));
    const double n = std::floor(kTwoPi / theta + 1.0 + 0.5);
    return kTwoPi / (n - 1.0);
}

double CircleRingCount(const CircleGeometry& geometry) {
    const double pitch = geometry.circular.pitchR;
    const double rings =
        std::floor((geometry.outerRadius - geometry.innerRadius + 0.001 * pitch) / pitch) + 1.0;
    return std::max(rings, 1.0);
}

double CircleModePointCount(const CircleGeometry& geometry, const CPattern& pattern) {
    const bool tooManyRings = CircleRingCount(geometry) > kMaxListPoints;
    const std::optional<CircleMode> mode = FindCircleMode(geometry);
    if (!mode)
        return 0.0;
    switch (*mode) {
    case CircleMode::Frame: {
        const std::optional<double> step = RingAngularStep(geometry.circular.pitchT, geometry.outerRadius);
        return step ? FramePointCount(*step) : 0.0;
    }
    case CircleMode::BothPasses:
        return tooManyRings ? 2.0 * CircleRingCount(geometry)
                            : PassPointCount(geometry, true) + PassPointCount(geometry, false);
    case CircleMode::OuterToInner:
        return tooManyRings ? CircleRingCount(geometry) : PassPointCount(geometry, false);
    case CircleMode::InnerToOuter:
        return tooManyRings ? CircleRingCount(geometry) : PassPointCount(geometry, true);
    case CircleMode::Rectangular:
        return SerpentineLineCount(geometry) > kMaxListPoints ? SerpentineLineCount(geometry)
                                                              : SerpentinePointCount(geometry, pattern);
    }
    return 0.0;
}

std::string CircleCountProblems(const CircleGeometry& geometry, const CPattern& pattern) {
    const double framing =
        static_cast<double>(pattern.GetLeadInPointCount()) + pattern.GetPostBlankingPointCount();
    return framing + CircleModePointCount(geometry, pattern) > kMaxListPoints ? "Pitch out of range. " : "";
}

std::int32_t CircleListPointCount(const CircleGeometry& geometry, const CPattern& pattern) {
    const std::string problems = CircleCountProblems(geometry, pattern);
    if (!problems.empty())
        throw std::invalid_argument(problems);
    return static_cast<std::int32_t>(pattern.GetLeadInPointCount() + CircleModePointCount(geometry, pattern) +
                                     pattern.GetPostBlankingPointCount());
}

void WriteCirclePoints(std::span<PatternPoint> points, const CircleGeometry& geometry,
                       const CPattern& pattern, std::uint8_t flags) {
    const CircleMode mode = ChooseCircleMode(geometry);
    const std::int32_t modeStart =
        pattern.AddLeadInPoints(points, PreBlankingPosition(mode, geometry, pattern), 0);
    CircleWriter writer(points, geometry, pattern, flags, modeStart);
    WriteMode(mode, writer, geometry, pattern, flags);
    pattern.AddPostBlankingPoints(points, writer.Last(), writer.Index());
}

double CircleEffectiveLoopTime(const CircleGeometry& geometry, const CPattern& pattern) {
    if (geometry.fillStyle == FillStyle_Frame)
        return FramePointCount(FrameStepOrThrow(geometry)) * geometry.outerDwellTime;
    if (geometry.fillStyle == FillStyle_Solid && geometry.multiPass == MultiPass_OneOrientation)
        return (PassLoopTime(geometry, true) + PassLoopTime(geometry, false)) / 2.0;
    if (geometry.fillStyle == FillStyle_Solid && geometry.multiPass == MultiPass_None) {
        if (geometry.circularKind && geometry.circular.scanType == CircleScanType_InnerToOuter)
            return PassLoopTime(geometry, true);
        if (geometry.circularKind && geometry.circular.scanType == CircleScanType_OuterToInner)
            return PassLoopTime(geometry, false);
        if (!geometry.circularKind && geometry.rectangular.scanType == ScanType_Serpentine)
            return SerpentineLoopTime(geometry, pattern);
    }
    throw HResultException(E_UNEXPECTED);
}

double BlankingGroupPointCount(double total, double resolution, double maxPointDwell) {
    if (!(total >= resolution))
        return 0.0;
    double share = total;
    double count = 1.0;
    while (share > maxPointDwell) {
        share /= 2.0;
        count += 1.0;
    }
    if (total / count > maxPointDwell)
        count = std::ceil(total / maxPointDwell);
    return count;
}

} // namespace Norvane::Lumis::Scanning

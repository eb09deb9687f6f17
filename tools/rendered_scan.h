// A rendering as plain values: what the summary, the point export and the preview read, copied out of
// the scan definition once.
#pragma once

#include <beamweaver/dwellmap.h>

#include <cstdint>
#include <vector>

namespace Norvane::Lumis::Scanning::Tool {

// An integer rectangle in DAC units; left/top are the minima, right/bottom the maxima, all inclusive.
struct DacRectangle {
    std::int32_t left;
    std::int32_t top;
    std::int32_t right;
    std::int32_t bottom;

    friend bool operator==(const DacRectangle&, const DacRectangle&) = default;
};

struct RenderedSubPattern {
    std::uint16_t offsetX;
    std::uint16_t offsetY;
    std::uint32_t repeatCount;
    std::vector<PatternPoint> points;
};

struct RenderedScan {
    double dwellTimeResolution; // seconds per dwell tick
    DacRectangle fieldOfView;
    std::uint32_t gatePulseIdleTicks;
    std::uint32_t acquisitionUpdatePoints;
    std::vector<RenderedSubPattern> subPatterns; // in playing order
};

// Points over all sub patterns, each list counted once (repeats not multiplied in).
std::uint64_t PointCount(const RenderedScan& scan);

} // namespace Norvane::Lumis::Scanning::Tool

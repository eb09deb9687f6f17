// The plain records behind the rendering-properties and alignment objects, and the scan device's
// configuration. Patterns hold and copy these; the value objects convert to and from them.
#pragma once

#include "module/geometry_values.h"

#include <beamweaver/enums.h>

#include <cstdint>

namespace Norvane::Lumis::Scanning {

// One axis of a pattern: the DAC span of the full field of view and the slew rate (increments per s).
struct PatternAlignment {
    RangeInt range{16384, 49152};
    double slewRate = 1.5e11;
    friend constexpr bool operator==(const PatternAlignment&, const PatternAlignment&) = default;
};

// Times in seconds.
struct PatternRenderingSettings {
    double targetDwellTimeResolution = 2.5e-8;
    double gatePulseIdleTime = 1.2e-6;
    double preBlankingTime = 1e-6;
    double postBlankingTime = 1e-6;
    double patternStartAsymmetryTime = 5e-8;
    GenerationStrategy generationStrategy = GenerationStrategy_UseAlignments;
    PatternAlignment alignmentX;
    PatternAlignment alignmentY;
    friend constexpr bool operator==(const PatternRenderingSettings&,
                                     const PatternRenderingSettings&) = default;
};

// One axis of a raster: span and slew rate as for patterns, plus the sync and flyback timing in seconds.
struct RasterAlignment {
    RangeInt range{16384, 49152};
    double slewRate = 1.5e11;
    double scanSync = 0.0;
    double preScan = 0.0;
    double acquisitionWaitTime = 0.0;
    double acquisitionDelay = 0.0;
    double preFlyback = 0.0;
    friend constexpr bool operator==(const RasterAlignment&, const RasterAlignment&) = default;
};

// Times in seconds.
struct RasterRenderingSettings {
    double targetDwellTimeResolution = 2.5e-8;
    double gatePulseIdleTime = 1.2e-6;
    double mainsLockPeriod = 0.02;
    RasterAlignment alignmentX;
    RasterAlignment alignmentY;
    friend constexpr bool operator==(const RasterRenderingSettings&,
                                     const RasterRenderingSettings&) = default;
};

// The scan device's dwell clock: its finest tick (s), the most ticks one point carries, and its coarsest
// tick (s).
struct ScanDeviceConfig {
    double dwellTimeUnit = 2.5e-8;
    std::int32_t maximumDwellTimeFactor = 4095;
    double maximumDwellTimeResolution = 6.4e-6;
    friend constexpr bool operator==(const ScanDeviceConfig&, const ScanDeviceConfig&) = default;
};

} // namespace Norvane::Lumis::Scanning

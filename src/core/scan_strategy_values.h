// The plain records behind the scan-strategy objects. Patterns hold and copy these; the strategy objects
// convert to and from them. Values are kept as given: the patterns that use a strategy validate it.
#pragma once

#include <beamweaver/dwellmap.h>
#include <beamweaver/enums.h>

namespace Norvane::Lumis::Scanning {

// Line orientation, directions and line order only.
struct RasterStrategy {
    ScanOrientation orientation = ScanOrientation_Horizontal;
    ScanDirection lineDirection = ScanDirection_Forward;
    ScanDirection frameDirection = ScanDirection_Forward;
    ScanType scanType = ScanType_Raster;
    friend constexpr bool operator==(const RasterStrategy&, const RasterStrategy&) = default;
};

// Pitches in relative units.
struct RectangularStrategy {
    double pitchX = 0.1;
    double pitchY = 0.1;
    ScanOrientation orientation = ScanOrientation_Horizontal;
    ScanDirection lineDirection = ScanDirection_Forward;
    ScanDirection frameDirection = ScanDirection_Forward;
    FillStyle fillStyle = FillStyle_Solid;
    ScanType scanType = ScanType_Raster;
    MultiPass multiPass = MultiPass_None;
    friend constexpr bool operator==(const RectangularStrategy&, const RectangularStrategy&) = default;
};

// Tangential and radial pitch in relative units.
struct CircularStrategy {
    double pitchT = 0.001;
    double pitchR = 0.01;
    FillStyle fillStyle = FillStyle_Solid;
    CircleScanType scanType = CircleScanType_InnerToOuter;
    MultiPass multiPass = MultiPass_None;
    friend constexpr bool operator==(const CircularStrategy&, const CircularStrategy&) = default;
};

} // namespace Norvane::Lumis::Scanning

// Scan strategies: in which order and at which spacing a pattern visits its area. Plain value holders:
// setters store any value; the patterns that use a strategy validate it.
#pragma once

#include <beamweaver/dwellmap.h>
#include <beamweaver/enums.h>
#include <beamweaver/identifiers.h>

// The common base; a pattern queries which kind it was given.
#define IScanStrategy_MEMBERS(X)
BW_INTERFACE(IScanStrategy, IDispatch, IScanStrategy_MEMBERS);

#define IScanStrategyRaster_MEMBERS(X)                                                                               \
    X(PROP, ScanOrientation, LineScanOrientation)                                                                    \
    X(PROP, ScanDirection, LineScanDirection)                                                                        \
    X(PROP, ScanDirection, FrameScanDirection)                                                                       \
    X(PROP, ScanType, ScanType)
BW_INTERFACE(IScanStrategyRaster, IScanStrategy, IScanStrategyRaster_MEMBERS);

// Pitches in relative units.
#define IScanStrategyRectangular_MEMBERS(X)                                                                          \
    X(PROP, ScanOrientation, LineScanOrientation)                                                                    \
    X(PROP, ScanDirection, LineScanDirection)                                                                        \
    X(PROP, ScanDirection, FrameScanDirection)                                                                       \
    X(PROP, ScanType, ScanType)                                                                                      \
    X(PROP, double, PitchX)                                                                                          \
    X(PROP, double, PitchY)                                                                                          \
    X(PROP, FillStyle, FillStyle)                                                                                    \
    X(PROP, MultiPass, MultiPass)
BW_INTERFACE(IScanStrategyRectangular, IScanStrategy, IScanStrategyRectangular_MEMBERS);

// Tangential and radial pitch in relative units.
#define IScanStrategyCircular_MEMBERS(X)                                                                             \
    X(PROP, double, PitchT)                                                                                          \
    X(PROP, double, PitchR)                                                                                          \
    X(PROP, FillStyle, FillStyle)                                                                                    \
    X(PROP, CircleScanType, ScanType)                                                                                \
    X(PROP, MultiPass, MultiPass)
BW_INTERFACE(IScanStrategyCircular, IScanStrategy, IScanStrategyCircular_MEMBERS);

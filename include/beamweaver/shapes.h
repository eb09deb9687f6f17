// The geometric milling patterns: shapes that lay their own points from a few geometry properties.
#pragma once

#include <beamweaver/comtypes.h>
#include <beamweaver/dwellmap.h>
#include <beamweaver/enums.h>
#include <beamweaver/identifiers.h>
#include <beamweaver/pattern.h>
#include <beamweaver/strategies.h>

// A straight row of equally spaced points from Begin to End (relative coordinates), with a dwell time
// running linearly from BeginDwellTime to EndDwellTime (seconds). Pitch is the spacing in relative units;
// ScanDirection 1 scans from End towards Begin; MultiPass_OneOrientation adds a return pass.
// GetEffectiveLoopTime is the time of one pass without blanking.
#define IPatternLine_MEMBERS(X)                                                                              \
    X(PROP, ICoordinateFloat*, Begin)                                                                        \
    X(PROP, ICoordinateFloat*, End)                                                                          \
    X(PROP, double, BeginDwellTime)                                                                          \
    X(PROP, double, EndDwellTime)                                                                            \
    X(PROP, double, Pitch)                                                                                   \
    X(PROP, ScanDirection, ScanDirection)                                                                    \
    X(PROP, ITransformationMatrix2D*, TransformationMatrix)                                                  \
    X(PROP, MultiPass, MultiPass)                                                                            \
    X(METHOD, GetEffectiveLoopTime, (double* loopTime))
BW_INTERFACE(IPatternLine, IPatternShape, IPatternLine_MEMBERS);

// A rectangle (relative coordinates) milled line by line or as its outline under a rectangular scan
// strategy, with a dwell ramping from BeginDwellTime on the first line to EndDwellTime on the last.
// GetEffectiveLoopTime is the time of one pass without blanking.
#define IPatternRectangle_MEMBERS(X)                                                                         \
    X(PROP, IRectangleFloat*, Rectangle)                                                                     \
    X(PROP, double, BeginDwellTime)                                                                          \
    X(PROP, double, EndDwellTime)                                                                            \
    X(PROP, IScanStrategyRectangular*, ScanStrategy)                                                         \
    X(PROP, ITransformationMatrix2D*, TransformationMatrix)                                                  \
    X(METHOD, GetEffectiveLoopTime, (double* loopTime))
BW_INTERFACE(IPatternRectangle, IPatternShape, IPatternRectangle_MEMBERS);

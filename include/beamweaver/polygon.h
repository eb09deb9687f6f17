// The polygon pattern: the inside (or only the outline) of an arbitrary, also concave, polygon milled by
// scan lines under a rectangular scan strategy.
#pragma once

#include <beamweaver/comtypes.h>
#include <beamweaver/dwellmap.h>
#include <beamweaver/enums.h>
#include <beamweaver/identifiers.h>
#include <beamweaver/pattern.h>
#include <beamweaver/strategies.h>

// Vertices in relative coordinates, the outline closed from the last back to the first; a dwell stepping
// per scan line from BeginDwellTime to EndDwellTime (seconds). GetEffectiveLoopTime is the time of one
// pass without blanking.
#define IPatternPolygon_MEMBERS(X)                                                                           \
    X(METHOD, AddPoint, (ICoordinateFloat * point))                                                          \
    X(METHOD, ModifyPoint, (std::int32_t index, ICoordinateFloat * point))                                   \
    X(PROP, double, BeginDwellTime)                                                                          \
    X(PROP, double, EndDwellTime)                                                                            \
    X(PROP, IScanStrategyRectangular*, ScanStrategy)                                                         \
    X(PROP, ITransformationMatrix2D*, TransformationMatrix)                                                  \
    X(METHOD, GetEffectiveLoopTime, (double* loopTime))
BW_INTERFACE(IPatternPolygon, IPatternShape, IPatternPolygon_MEMBERS);

// The circle pattern: a disc or annulus milled along concentric rings or clipped serpentine lines.
#pragma once

#include <beamweaver/shapes.h>
#include <beamweaver/strategies.h>

// A disc or annulus around Center (relative coordinates) between InnerRadius and OuterRadius (relative
// units), with a dwell running linearly from InnerDwellTime at the inner radius to OuterDwellTime at the
// outer one (seconds). ScanStrategy is a circular strategy (rings) or a rectangular one (horizontal
// serpentine lines clipped to the annulus, with InnerCircleBlankingTime spent blanked at each edge of the
// hole). GetEffectiveLoopTime is the time of one pass without blanking.
#define IPatternCircle_MEMBERS(X)                                                                            \
    X(PROP, ICoordinateFloat*, Center)                                                                       \
    X(PROP, double, InnerRadius)                                                                             \
    X(PROP, double, OuterRadius)                                                                             \
    X(PROP, double, InnerDwellTime)                                                                          \
    X(PROP, double, OuterDwellTime)                                                                          \
    X(PROP, IScanStrategy*, ScanStrategy)                                                                    \
    X(PROP, ITransformationMatrix2D*, TransformationMatrix)                                                  \
    X(PROP, double, InnerCircleBlankingTime)                                                                 \
    X(METHOD, GetEffectiveLoopTime, (double* loopTime))
BW_INTERFACE(IPatternCircle, IPatternShape, IPatternCircle_MEMBERS);

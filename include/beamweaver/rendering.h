// Rendering properties and alignments: what a pattern knows of the scan device it renders for.
#pragma once

#include <beamweaver/comtypes.h>
#include <beamweaver/enums.h>
#include <beamweaver/identifiers.h>

// The DAC span of the full field of view on one axis, and the axis's slew rate (DAC increments per s).
#define IScanAlignments_MEMBERS(X)                                                                                   \
    X(PROP, IRangeInt*, Range)                                                                                       \
    X(PROP, double, SlewRate)
BW_INTERFACE(IScanAlignments, IDispatch, IScanAlignments_MEMBERS);

#define IPatternAlignments_MEMBERS(X)
BW_INTERFACE(IPatternAlignments, IScanAlignments, IPatternAlignments_MEMBERS);

// Raster timing per axis, all in seconds.
#define IRasterAlignments_MEMBERS(X)                                                                                 \
    X(PROP, double, ScanSync)                                                                                        \
    X(PROP, double, PreScan)                                                                                         \
    X(PROP, double, AcquisitionWaitTime)                                                                             \
    X(PROP, double, AcquisitionDelay)                                                                                \
    X(PROP, double, PreFlyback)
BW_INTERFACE(IRasterAlignments, IScanAlignments, IRasterAlignments_MEMBERS);

// Requested dwell clock resolution and minimum gate-pulse spacing, in seconds.
#define IScanRenderingProperties_MEMBERS(X)                                                                          \
    X(PROP, double, TargetDwellTimeResolution)                                                                       \
    X(PROP, double, GatePulseIdleTime)
BW_INTERFACE(IScanRenderingProperties, IDispatch, IScanRenderingProperties_MEMBERS);

#define IPatternRenderingProperties_MEMBERS(X)                                                                       \
    X(PROP, double, PreBlankingTime)                                                                                 \
    X(PROP, double, PostBlankingTime)                                                                                \
    X(PROP, double, PatternStartAsymmetryTime)                                                                       \
    X(PROP, GenerationStrategy, GenerationStrategy)                                                                  \
    X(PROP, IPatternAlignments*, PatternAlignmentsX)                                                                 \
    X(PROP, IPatternAlignments*, PatternAlignmentsY)
BW_INTERFACE(IPatternRenderingProperties, IScanRenderingProperties, IPatternRenderingProperties_MEMBERS);

#define IRasterRenderingProperties_MEMBERS(X)                                                                        \
    X(PROP, double, MainsLockPeriod)                                                                                 \
    X(PROP, IRasterAlignments*, RasterAlignmentsX)                                                                   \
    X(PROP, IRasterAlignments*, RasterAlignmentsY)
BW_INTERFACE(IRasterRenderingProperties, IScanRenderingProperties, IRasterRenderingProperties_MEMBERS);

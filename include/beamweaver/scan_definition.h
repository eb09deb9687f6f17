// Render output: a collection of sub patterns plus the values the scan device needs to play them.
// Scan definitions are immutable; every getter copies a stored value (or hands out a new object).
#pragma once

#include <beamweaver/comtypes.h>
#include <beamweaver/dwellmap.h>
#include <beamweaver/identifiers.h>

#define IScanDefinition_MEMBERS(X)                                                                                   \
    X(GET, ISubPatternCollection*, SubPatternCollection)                                                            \
    X(GET, ScanSynchronizationSource, ScanSynchronizationSource)                                                     \
    X(GET, std::uint32_t, GatePulseIdleTicks)                                                                        \
    X(GET, std::uint32_t, AcquisitionUpdatePoints)
BW_INTERFACE(IScanDefinition, IDispatch, IScanDefinition_MEMBERS);

#define IPatternScanDefinition_MEMBERS(X)                                                                            \
    X(GET, VARIANT_BOOL, AllowSubPatternNavigation)                                                                  \
    X(GET, VARIANT_BOOL, BlankBeamBetweenSubPatterns)
BW_INTERFACE(IPatternScanDefinition, IScanDefinition, IPatternScanDefinition_MEMBERS);

#define IRasterScanDefinition_MEMBERS(X)                                                                             \
    X(GET, ISizeInt*, ImageSize)                                                                                     \
    X(GET, std::int32_t, LineInterlace)                                                                              \
    X(GET, std::int32_t, ScanType)                                                                                   \
    X(GET, std::int32_t, LineScanOrientation)                                                                        \
    X(GET, std::int32_t, LineScanDirection)                                                                          \
    X(GET, std::int32_t, FrameScanDirection)                                                                         \
    X(GET, IRectangleInt*, SelectedArea)
BW_INTERFACE(IRasterScanDefinition, IScanDefinition, IRasterScanDefinition_MEMBERS);

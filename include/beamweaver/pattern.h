// The interfaces every pattern shares: validation, rendering, loop time, cloning and exclusion.
#pragma once

#include <beamweaver/comtypes.h>
#include <beamweaver/dwellmap.h>
#include <beamweaver/enums.h>
#include <beamweaver/exclusion.h>
#include <beamweaver/identifiers.h>
#include <beamweaver/rendering.h>
#include <beamweaver/scan_definition.h>

struct IPatternRectangle;
struct IPatternLine;
struct IPatternSpot;
struct IPatternCircle;
struct IPatternPolygon;
struct IPatternRegularCrossSection;
struct IPatternMultiPassCrossSection;
struct IPatternStreamFile;
struct IPatternBitmapFile;
struct IBeamweaverCollection;

// Whether a pattern can be rendered, and if not why: "<name> out of range. " messages in a fixed order.
#define IPatternValidationResult_MEMBERS(X)                                                                          \
    X(GET, VARIANT_BOOL, Valid)                                                                                      \
    X(GET, BSTR, Description)
BW_INTERFACE(IPatternValidationResult, IDispatch, IPatternValidationResult_MEMBERS);

// Times in seconds; the bounding box in DAC units of the rendered points.
#define IPattern_MEMBERS(X)                                                                                          \
    X(METHOD, ClassID, (GUID * clsid))                                                                               \
    X(METHOD, Validate, (IPatternValidationResult * *result))                                                        \
    X(METHOD, Render, (IScanDefinition * *scanDefinition))                                                           \
    X(METHOD, GetLoopTime, (double* loopTime))                                                                       \
    X(METHOD, GetMinDwellTime, (double* dwellTime))                                                                  \
    X(METHOD, GetMaxDwellTime, (double* dwellTime))                                                                  \
    X(METHOD, GetDacBoundingBox, (IRectangleInt * *boundingBox))                                                     \
    X(METHOD, GetDwellTimeResolution, (double* resolution))                                                          \
    X(PROP, double, AcquisitionUpdateInterval)                                                                       \
    X(PROP, VARIANT_BOOL, EnableGatePulse)                                                                           \
    X(PROP, ScanSynchronizationSource, ScanSynchronizationSource)
BW_INTERFACE(IPattern, IDispatch, IPattern_MEMBERS);

struct IPatternShapeVisitor;

#define IPatternShape_MEMBERS(X)                                                                                     \
    X(PROP, IPatternRenderingProperties*, RenderingProperties)                                                       \
    X(METHOD, Accept, (IPatternShapeVisitor * visitor))
BW_INTERFACE(IPatternShape, IPattern, IPatternShape_MEMBERS);

// Double dispatch over the pattern kinds: Accept calls the method for the pattern's own kind.
#define IPatternShapeVisitor_MEMBERS(X)                                                                              \
    X(METHOD, VisitPatternRectangle, (IPatternRectangle * pattern))                                                  \
    X(METHOD, VisitPatternLine, (IPatternLine * pattern))                                                            \
    X(METHOD, VisitPatternSpot, (IPatternSpot * pattern))                                                            \
    X(METHOD, VisitPatternCircle, (IPatternCircle * pattern))                                                        \
    X(METHOD, VisitPatternPolygon, (IPatternPolygon * pattern))                                                      \
    X(METHOD, VisitPatternRegularCrossSection, (IPatternRegularCrossSection * pattern))                              \
    X(METHOD, VisitPatternMultiPassCrossSection, (IPatternMultiPassCrossSection * pattern))                          \
    X(METHOD, VisitPatternStreamFile, (IPatternStreamFile * pattern))                                                \
    X(METHOD, VisitPatternBitmapFile, (IPatternBitmapFile * pattern))                                                \
    X(METHOD, VisitBeamweaverCollection, (IBeamweaverCollection * collection))
BW_INTERFACE(IPatternShapeVisitor, IUnknown, IPatternShapeVisitor_MEMBERS);

#define ICloneablePattern_MEMBERS(X)                                                                                 \
    X(METHOD, Clone, (IPattern * *clone))                                                                            \
    X(METHOD, CopyTo, (IPattern * target))
BW_INTERFACE(ICloneablePattern, IUnknown, ICloneablePattern_MEMBERS);

// Removes points from rendered point lists in place; offsets are the sub pattern's DAC offsets.
#define IPatternPointFilter_MEMBERS(X)                                                                               \
    X(METHOD, FilterList, (IPatternPointList * list))                                                                \
    X(METHOD, FilterListWithOffset, (IPatternPointList * list, std::uint16_t offsetX, std::uint16_t offsetY))
BW_INTERFACE(IPatternPointFilter, IUnknown, IPatternPointFilter_MEMBERS);

#define IExclusionAwarePattern_MEMBERS(X)                                                                            \
    X(METHOD, RenderWithExclusion, (IPatternPointFilter * filter, IScanDefinition * *scanDefinition))                \
    X(METHOD, SetExclusionZone, (IExclusionZone * zone))                                                             \
    X(METHOD, ClearExclusionZone, ())
BW_INTERFACE(IExclusionAwarePattern, IUnknown, IExclusionAwarePattern_MEMBERS);

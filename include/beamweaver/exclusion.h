// Exclusion shapes and zones: areas whose points are removed from renderings.
#pragma once

#include <beamweaver/comtypes.h>
#include <beamweaver/identifiers.h>

// An area in relative coordinates with its own matrix (shape to field) and the DAC ranges of the full
// field, used to turn a DAC point into relative coordinates.
#define IShape_MEMBERS(X)                                                                                            \
    X(PROP, ITransformationMatrix2D*, TransformationMatrix)                                                          \
    X(PROP, IRangeInt*, DACRangeX)                                                                                   \
    X(PROP, IRangeInt*, DACRangeY)                                                                                   \
    X(METHOD, Clone, (IShape * *clone))                                                                              \
    X(METHOD, CopyTo, (IShape * target))
BW_INTERFACE(IShape, IDispatch, IShape_MEMBERS);

#define IShapeRectangle_MEMBERS(X) X(PROP, IRectangleFloat*, Rectangle)
BW_INTERFACE(IShapeRectangle, IShape, IShapeRectangle_MEMBERS);

// An annulus: points between the two radii (both edges included).
#define IShapeCircle_MEMBERS(X)                                                                                      \
    X(PROP, ICoordinateFloat*, Center)                                                                               \
    X(PROP, double, InnerRadius)                                                                                     \
    X(PROP, double, OuterRadius)
BW_INTERFACE(IShapeCircle, IShape, IShapeCircle_MEMBERS);

#define IShapePolygon_MEMBERS(X)                                                                                     \
    X(METHOD, AddPoint, (ICoordinateFloat * point))                                                                  \
    X(METHOD, ModifyPoint, (std::int32_t index, ICoordinateFloat * point))
BW_INTERFACE(IShapePolygon, IShape, IShapePolygon_MEMBERS);

// A pattern that can serve as an exclusion shape: marked, it renders blanked and registers its shape
// with its exclusion zone.
#define IExcludablePatternShape_MEMBERS(X)                                                                           \
    X(PROP, VARIANT_BOOL, IsExclusion)                                                                               \
    X(GET, IShape*, Shape)
BW_INTERFACE(IExcludablePatternShape, IUnknown, IExcludablePatternShape_MEMBERS);

// Shapes held by reference, in insertion order; duplicates allowed.
#define IExclusionZone_MEMBERS(X)                                                                                    \
    X(METHOD, AddShape, (IShape * shape))                                                                            \
    X(METHOD, RemoveShape, (IShape * shape))                                                                         \
    X(METHOD, ContainsShape, (IShape * shape, VARIANT_BOOL * contained))                                             \
    X(METHOD, AddShapeFromPatternShape, (IExcludablePatternShape * patternShape))                                    \
    X(METHOD, Clear, ())                                                                                             \
    X(METHOD, Clone, (IExclusionZone * *clone))                                                                      \
    X(METHOD, CopyTo, (IExclusionZone * target))
BW_INTERFACE(IExclusionZone, IDispatch, IExclusionZone_MEMBERS);

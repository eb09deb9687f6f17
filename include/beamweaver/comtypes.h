// Geometry value interfaces: small dual objects that carry coordinates, rectangles, ranges, sizes and
// affine matrices across interfaces. Each property is a get/put pair, in the order of the value's fields.
#pragma once

#include "platform/member_description.h"

#include <beamweaver/identifiers.h>

#define ICoordinateFloat_MEMBERS(M)                                                                          \
    M(PROP, double, X)                                                                                       \
    M(PROP, double, Y)
BW_INTERFACE(ICoordinateFloat, IDispatch, ICoordinateFloat_MEMBERS);

#define IRectangleFloat_MEMBERS(M)                                                                           \
    M(PROP, double, Left)                                                                                    \
    M(PROP, double, Top)                                                                                     \
    M(PROP, double, Right)                                                                                   \
    M(PROP, double, Bottom)
BW_INTERFACE(IRectangleFloat, IDispatch, IRectangleFloat_MEMBERS);

#define IRectangleInt_MEMBERS(M)                                                                             \
    M(PROP, std::int32_t, Left)                                                                              \
    M(PROP, std::int32_t, Top)                                                                               \
    M(PROP, std::int32_t, Right)                                                                             \
    M(PROP, std::int32_t, Bottom)
BW_INTERFACE(IRectangleInt, IDispatch, IRectangleInt_MEMBERS);

#define IRangeInt_MEMBERS(M)                                                                                 \
    M(PROP, std::int32_t, Minimum)                                                                           \
    M(PROP, std::int32_t, Maximum)
BW_INTERFACE(IRangeInt, IDispatch, IRangeInt_MEMBERS);

#define ISize2DInt_MEMBERS(M)                                                                                \
    M(PROP, std::int32_t, Width)                                                                             \
    M(PROP, std::int32_t, Height)
BW_INTERFACE(ISize2DInt, IDispatch, ISize2DInt_MEMBERS);

// Maps (x, y) to (M0·x + M1·y + M2, M3·x + M4·y + M5).
#define ITransformationMatrix2D_MEMBERS(M)                                                                   \
    M(PROP, double, M0)                                                                                      \
    M(PROP, double, M1)                                                                                      \
    M(PROP, double, M2)                                                                                      \
    M(PROP, double, M3)                                                                                      \
    M(PROP, double, M4)                                                                                      \
    M(PROP, double, M5)
BW_INTERFACE(ITransformationMatrix2D, IDispatch, ITransformationMatrix2D_MEMBERS);

// The size the library hands out itself in render results.
#define ISizeInt_MEMBERS(M)                                                                                  \
    M(PROP, std::int32_t, Width)                                                                             \
    M(PROP, std::int32_t, Height)
BW_INTERFACE(ISizeInt, IDispatch, ISizeInt_MEMBERS);

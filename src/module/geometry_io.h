// Reading geometry value objects into plain records, creating value objects from records, and the
// checks that properties taking relative positions share.
#pragma once

#include "module/geometry_values.h"
#include "platform/com_ptr.h"

#include <beamweaver/comtypes.h>

#include <string_view>

namespace Norvane::Lumis {

// Readers call the getters in field order. A null pointer throws HResultException:
// size and float rectangle E_INVALIDARG ("null ISize2DInt", "null IRectangleFloat"); integer rectangle,
// range, coordinate and matrix E_POINTER ("null IRectangleInt", "null IRangeInt", "null ICoordinateFloat",
// "null ITransformationMatrix2D"). A failing getter throws its HRESULT with the callee's error information.
coordinate<double> ReadCoordinate(ICoordinateFloat* value);
RectangleFloat ReadRectangleFloat(IRectangleFloat* value);
RectangleInt ReadRectangleInt(IRectangleInt* value);
RangeInt ReadRange(IRangeInt* value);
SizeInt ReadSize(ISize2DInt* value);
TransformationMatrix ReadMatrix(ITransformationMatrix2D* value);

// Creators make a new object by class identifier and call its setters in field order. A failed creation
// throws HResultException(hr) with source "CoCreateInstance({CLSID})"; a failed setter throws its HRESULT.
CComPtr<ICoordinateFloat> CreateCoordinate(const coordinate<double>& value);
CComPtr<IRectangleFloat> CreateRectangleFloat(const RectangleFloat& value);
CComPtr<IRectangleInt> CreateRectangleInt(const RectangleInt& value);
CComPtr<IRangeInt> CreateRange(const RangeInt& value);
CComPtr<ISize2DInt> CreateSize(const SizeInt& value);
CComPtr<ITransformationMatrix2D> CreateMatrix(const TransformationMatrix& value);

// Whether a position lies in the field of view: 0 <= x <= 1 and 0 <= y <= 1 (not-a-number never does).
bool IsRelativeCoordinate(const coordinate<double>& value);
// Whether a rectangle lies in the field of view with its corners in order; zero width or height passes.
bool IsRelativeRectangle(const RectangleFloat& value);

// Relative position checks, with the property's name in the message: null gives "<name> object is null",
// a coordinate outside [0, 1] on either axis "<name> values not correct" (std::invalid_argument).
coordinate<double> ReadRelativeCoordinate(ICoordinateFloat* value, std::string_view name);
// Rectangle check: 0 <= left <= right <= 1 and 0 <= top <= bottom <= 1, else "Rectangle values not correct";
// null gives "Rectangle object is null".
RectangleFloat ReadRelativeRectangle(IRectangleFloat* value);
// Matrix object for a property: null gives "<name> object is null".
TransformationMatrix ReadMatrixProperty(ITransformationMatrix2D* value, std::string_view name);

// Inverse of an affine map; a determinant of exactly zero (or not a number) throws std::overflow_error
// "matrix inverse does not exist", and so does an inverse whose coefficients are not finite.
TransformationMatrix InvertMatrix(const TransformationMatrix& m);

} // namespace Norvane::Lumis

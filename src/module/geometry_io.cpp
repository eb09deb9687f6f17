#include "module/geometry_io.h"

#include "module/create_instance.h"
#include "module/error_reporting.h"
#include "module/hresult_exception.h"

#include <cmath>
#include <stdexcept>
#include <string>
#include <type_traits>

namespace Norvane::Lumis {

namespace {

// The value object behind a reader's argument; null is refused with hr and "null <interface name>".
template <class I> I& RequireValue(I* value, HRESULT hr) {
    if (value == nullptr)
        throw HResultException(hr, std::string("null ") + I::Description().name);
    return *value;
}

// Calls one getter; a failure carries the callee's HRESULT and error information.
template <class I, class T> T Get(I& object, HRESULT (I::*getter)(T*)) {
    T value{};
    CheckResult((object.*getter)(&value));
    return value;
}

// Calls one setter; a failure carries the callee's HRESULT and error information.
template <class I, class T> void Put(I& object, HRESULT (I::*setter)(T), std::type_identity_t<T> value) {
    CheckResult((object.*setter)(value));
}

void RequireProperty(const void* value, std::string_view name) {
    if (value == nullptr)
        throw std::invalid_argument(std::string(name) + " object is null");
}

bool IsRelative(double value) {
    return value >= 0.0 && value <= 1.0;
}

bool IsFinite(const TransformationMatrix& m) {
    return std::isfinite(m.m0) && std::isfinite(m.m1) && std::isfinite(m.m2) && std::isfinite(m.m3) &&
           std::isfinite(m.m4) && std::isfinite(m.m5);
}

[[noreturn]] void ThrowNoInverse() {
    throw std::overflow_error("matrix inverse does not exist");
}

} // namespace

coordinate<double> ReadCoordinate(ICoordinateFloat* value) {
    auto& object = RequireValue(value, E_POINTER);
    return {.x = Get(object, &ICoordinateFloat::get_X), .y = Get(object, &ICoordinateFloat::get_Y)};
}

RectangleFloat ReadRectangleFloat(IRectangleFloat* value) {
    auto& object = RequireValue(value, E_INVALIDARG);
    return {.left = Get(object, &IRectangleFloat::get_Left),
            .top = Get(object, &IRectangleFloat::get_Top),
            .right = Get(object, &IRectangleFloat::get_Right),
            .bottom = Get(object, &IRectangleFloat::get_Bottom)};
}

RectangleInt ReadRectangleInt(IRectangleInt* value) {
    auto& object = RequireValue(value, E_POINTER);
    return {.left = Get(object, &IRectangleInt::get_Left),
            .top = Get(object, &IRectangleInt::get_Top),
            .right = Get(object, &IRectangleInt::get_Right),
            .bottom = Get(object, &IRectangleInt::get_Bottom)};
}

RangeInt ReadRange(IRangeInt* value) {
    auto& object = RequireValue(value, E_POINTER);
    return {.minimum = Get(object, &IRangeInt::get_Minimum), .maximum = Get(object, &IRangeInt::get_Maximum)};
}

SizeInt ReadSize(ISize2DInt* value) {
    auto& object = RequireValue(value, E_INVALIDARG);
    return {.width = Get(object, &ISize2DInt::get_Width), .height = Get(object, &ISize2DInt::get_Height)};
}

TransformationMatrix ReadMatrix(ITransformationMatrix2D* value) {
    auto& object = RequireValue(value, E_POINTER);
    return {.m0 = Get(object, &ITransformationMatrix2D::get_M0),
            .m1 = Get(object, &ITransformationMatrix2D::get_M1),
            .m2 = Get(object, &ITransformationMatrix2D::get_M2),
            .m3 = Get(object, &ITransformationMatrix2D::get_M3),
            .m4 = Get(object, &ITransformationMatrix2D::get_M4),
            .m5 = Get(object, &ITransformationMatrix2D::get_M5)};
}

CComPtr<ICoordinateFloat> CreateCoordinate(const coordinate<double>& value) {
    auto object = CreateInstance<ICoordinateFloat>(CLSID_CoordinateFloat);
    Put(*object, &ICoordinateFloat::put_X, value.x);
    Put(*object, &ICoordinateFloat::put_Y, value.y);
    return object;
}

CComPtr<IRectangleFloat> CreateRectangleFloat(const RectangleFloat& value) {
    auto object = CreateInstance<IRectangleFloat>(CLSID_RectangleFloat);
    Put(*object, &IRectangleFloat::put_Left, value.left);
    Put(*object, &IRectangleFloat::put_Top, value.top);
    Put(*object, &IRectangleFloat::put_Right, value.right);
    Put(*object, &IRectangleFloat::put_Bottom, value.bottom);
    return object;
}

CComPtr<IRectangleInt> CreateRectangleInt(const RectangleInt& value) {
    auto object = CreateInstance<IRectangleInt>(CLSID_RectangleInt);
    Put(*object, &IRectangleInt::put_Left, value.left);
    Put(*object, &IRectangleInt::put_Top, value.top);
    Put(*object, &IRectangleInt::put_Right, value.right);
    Put(*object, &IRectangleInt::put_Bottom, value.bottom);
    return object;
}

CComPtr<IRangeInt> CreateRange(const RangeInt& value) {
    auto object = CreateInstance<IRangeInt>(CLSID_RangeInt);
    Put(*object, &IRangeInt::put_Minimum, value.minimum);
    Put(*object, &IRangeInt::put_Maximum, value.maximum);
    return object;
}

CComPtr<ISize2DInt> CreateSize(const SizeInt& value) {
    auto object = CreateInstance<ISize2DInt>(CLSID_Size2DInt);
    Put(*object, &ISize2DInt::put_Width, value.width);
    Put(*object, &ISize2DInt::put_Height, value.height);
    return object;
}

CComPtr<ITransformationMatrix2D> CreateMatrix(const TransformationMatrix& value) {
    auto object = CreateInstance<ITransformationMatrix2D>(CLSID_TransformationMatrix2D);
    Put(*object, &ITransformationMatrix2D::put_M0, value.m0);
    Put(*object, &ITransformationMatrix2D::put_M1, value.m1);
    Put(*object, &ITransformationMatrix2D::put_M2, value.m2);
    Put(*object, &ITransformationMatrix2D::put_M3, value.m3);
    Put(*object, &ITransformationMatrix2D::put_M4, value.m4);
    Put(*object, &ITransformationMatrix2D::put_M5, value.m5);
    return object;
}

bool IsRelativeCoordinate(const coordinate<double>& value) {
    return IsRelative(value.x) && IsRelative(value.y);
}

bool IsRelativeRectangle(const RectangleFloat& value) {
    return value.left >= 0.0 && value.top >= 0.0 && value.right >= value.left && value.bottom >= value.top &&
           value.right <= 1.0 && value.bottom <= 1.0;
}

coordinate<double> ReadRelativeCoordinate(ICoordinateFloat* value, std::string_view name) {
    RequireProperty(value, name);
    const auto result = ReadCoordinate(value);
    if (!IsRelativeCoordinate(result))
        throw std::invalid_argument(std::string(name) + " values not correct");
    return result;
}

RectangleFloat ReadRelativeRectangle(IRectangleFloat* value) {
    RequireProperty(value, "Rectangle");
    const auto result = ReadRectangleFloat(value);
    if (!IsRelativeRectangle(result))
        throw std::invalid_argument("Rectangle values not correct");
    return result;
}

TransformationMatrix ReadMatrixProperty(ITransformationMatrix2D* value, std::string_view name) {
    RequireProperty(value, name);
    return ReadMatrix(value);
}

TransformationMatrix InvertMatrix(const TransformationMatrix& m) {
    const double det = m.m0 * m.m4 - m.m1 * m.m3;
    if (!(det < 0.0 || det > 0.0))
        ThrowNoInverse();
    const TransformationMatrix inverse{.m0 = m.m4 / det,
                                       .m1 = -m.m1 / det,
                                       .m2 = (m.m5 * m.m1 - m.m2 * m.m4) / det,
                                       .m3 = -m.m3 / det,
                                       .m4 = m.m0 / det,
                                       .m5 = (m.m3 * m.m2 - m.m0 * m.m5) / det};
    if (!IsFinite(inverse))
        ThrowNoInverse();
    return inverse;
}

} // namespace Norvane::Lumis

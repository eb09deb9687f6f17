#include "composition/shape_circle.h"

#include "module/error_reporting.h"

namespace Norvane::Lumis::Scanning {

CShapeCircle::CShapeCircle() : ShapeImpl<IShapeCircle>(CLSID_ShapeCircle) {}

HRESULT CShapeCircle::get_Center(ICoordinateFloat** value) {
    return Guarded(IID_IShapeCircle, fieldMutex_, value,
                   [&] { *value = CreateCoordinate(circle_.center).Detach(); });
}

// A null coordinate fails as reading any coordinate does (E_POINTER, "null ICoordinateFloat").
HRESULT CShapeCircle::put_Center(ICoordinateFloat* value) {
    return Guarded(IID_IShapeCircle, fieldMutex_, [&] {
        const coordinate<double> center = ReadCoordinate(value);
        if (!IsRelativeCoordinate(center))
            throw std::invalid_argument("Origin values not correct");
        circle_.center = center;
    });
}

HRESULT CShapeCircle::get_InnerRadius(double* value) {
    return Guarded(IID_IShapeCircle, fieldMutex_, value, [&] { *value = circle_.innerRadius; });
}

HRESULT CShapeCircle::put_InnerRadius(double value) {
    return PutRadius(value, &CircleShapeGeometry::innerRadius, "Inner radius value is not correct");
}

HRESULT CShapeCircle::get_OuterRadius(double* value) {
    return Guarded(IID_IShapeCircle, fieldMutex_, value, [&] { *value = circle_.outerRadius; });
}

HRESULT CShapeCircle::put_OuterRadius(double value) {
    return PutRadius(value, &CircleShapeGeometry::outerRadius, "Outer radius value is not correct");
}

bool CShapeCircle::Contains(coordinate<double> point) {
    const CircleShapeGeometry circle = StoredGeometry();
    const double dx = point.x - circle.center.x;
    const double dy = point.y - circle.center.y;
    const double distanceSquared = dx * dx + dy * dy;
    return circle.innerRadius * circle.innerRadius <= distanceSquared &&
           distanceSquared <= circle.outerRadius * circle.outerRadius;
}

void CShapeCircle::CopyShapeTo(IShape* target) {
    CComPtr<IShapeCircle> circle = QueryShapeKind<IShapeCircle>(target, "pIShape object is not a circle");
    const CircleShapeGeometry geometry = StoredGeometry();
    CheckResult(circle->put_Center(CreateCoordinate(geometry.center)));
    CheckResult(circle->put_InnerRadius(geometry.innerRadius));
    CheckResult(circle->put_OuterRadius(geometry.outerRadius));
}

// Radii are relative lengths from 0 to 1; not-a-number is refused too.
HRESULT CShapeCircle::PutRadius(double value, double CircleShapeGeometry::*field, const char* failure) {
    return Guarded(IID_IShapeCircle, fieldMutex_, [&] {
        if (!(value >= 0.0 && value <= 1.0))
            throw std::invalid_argument(failure);
        circle_.*field = value;
    });
}

CircleShapeGeometry CShapeCircle::StoredGeometry() {
    boost::lock_guard<ObjectMutex> lock(fieldMutex_);
    return circle_;
}

} // namespace Norvane::Lumis::Scanning

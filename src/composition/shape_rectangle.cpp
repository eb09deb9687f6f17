#include "composition/shape_rectangle.h"

#include "module/error_reporting.h"

namespace Norvane::Lumis::Scanning {

CShapeRectangle::CShapeRectangle() : ShapeImpl<IShapeRectangle>(CLSID_ShapeRectangle) {}

HRESULT CShapeRectangle::get_Rectangle(IRectangleFloat** value) {
    return Guarded(IID_IShapeRectangle, fieldMutex_, value,
                   [&] { *value = CreateRectangleFloat(rectangle_).Detach(); });
}

HRESULT CShapeRectangle::put_Rectangle(IRectangleFloat* value) {
    return Guarded(IID_IShapeRectangle, fieldMutex_, [&] { rectangle_ = ReadRelativeRectangle(value); });
}

bool CShapeRectangle::Contains(coordinate<double> point) {
    const RectangleFloat r = StoredRectangle();
    return r.left <= point.x && point.x <= r.right && r.top <= point.y && point.y <= r.bottom;
}

void CShapeRectangle::CopyShapeTo(IShape* target) {
    CComPtr<IShapeRectangle> rectangle =
        QueryShapeKind<IShapeRectangle>(target, "pIShape object is not a rectangle");
    CheckResult(rectangle->put_Rectangle(CreateRectangleFloat(StoredRectangle())));
}

RectangleFloat CShapeRectangle::StoredRectangle() {
    boost::lock_guard<ObjectMutex> lock(fieldMutex_);
    return rectangle_;
}

} // namespace Norvane::Lumis::Scanning

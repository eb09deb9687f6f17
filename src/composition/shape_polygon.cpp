#include "composition/shape_polygon.h"

#include "composition/polygon_containment.h"
#include "module/error_reporting.h"

namespace Norvane::Lumis::Scanning {

CShapePolygon::CShapePolygon() : ShapeImpl<IShapePolygon>(CLSID_ShapePolygon) {}

HRESULT CShapePolygon::AddPoint(ICoordinateFloat* point) {
    return Guarded(IID_IShapePolygon, fieldMutex_,
                   [&] { vertices_.push_back(ReadRelativeCoordinate(point, "Point")); });
}

HRESULT CShapePolygon::ModifyPoint(std::int32_t index, ICoordinateFloat* point) {
    return Guarded(IID_IShapePolygon, fieldMutex_, [&] {
        const coordinate<double> vertex = ReadRelativeCoordinate(point, "Point");
        if (index < 0 || static_cast<std::size_t>(index) >= vertices_.size())
            throw std::invalid_argument("Index out of range");
        vertices_[static_cast<std::size_t>(index)] = vertex;
    });
}

bool CShapePolygon::Contains(coordinate<double> point) {
    boost::lock_guard<ObjectMutex> lock(fieldMutex_);
    return PolygonContains(vertices_, point);
}

// Works from a copy of the vertices, so copying a polygon into itself doubles its outline instead of
// appending to the array being read.
void CShapePolygon::CopyShapeTo(IShape* target) {
    CComPtr<IShapePolygon> polygon = QueryShapeKind<IShapePolygon>(target, "pIShape object is not a polygon");
    for (const coordinate<double>& vertex : StoredVertices())
        CheckResult(polygon->AddPoint(CreateCoordinate(vertex)));
}

std::vector<coordinate<double>> CShapePolygon::StoredVertices() {
    boost::lock_guard<ObjectMutex> lock(fieldMutex_);
    return vertices_;
}

} // namespace Norvane::Lumis::Scanning

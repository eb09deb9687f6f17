// An exclusion polygon: the area enclosed by its closed outline (concave and self-crossing outlines
// included, decided by a winding count). Vertices can be appended and replaced, not removed or read.
#pragma once

#include "composition/shape_impl.h"

#include <vector>

namespace Norvane::Lumis::Scanning {

class CShapePolygon : public ShapeImpl<IShapePolygon> {
  public:
    using Interfaces = InterfaceMap<IShapePolygon, IPatternPointFilter, ISupportErrorInfo>;

    CShapePolygon();

    // IShapePolygon
    HRESULT AddPoint(ICoordinateFloat* point) override;
    HRESULT ModifyPoint(std::int32_t index, ICoordinateFloat* point) override;

    // An empty polygon contains nothing.
    bool Contains(coordinate<double> point) override;

  protected:
    // Appends this polygon's vertices to the target's, in order.
    void CopyShapeTo(IShape* target) override;

  private:
    std::vector<coordinate<double>> StoredVertices();

    ObjectMutex fieldMutex_;
    std::vector<coordinate<double>> vertices_;
};

} // namespace Norvane::Lumis::Scanning

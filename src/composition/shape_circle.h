// An exclusion annulus: the points whose distance from the center lies between the inner and the outer
// radius, both rims included. An inner radius above the outer one leaves a shape that contains nothing.
#pragma once

#include "composition/shape_impl.h"

namespace Norvane::Lumis::Scanning {

struct CircleShapeGeometry {
    coordinate<double> center;
    double innerRadius = 0.0;
    double outerRadius = 0.0;
};

class CShapeCircle : public ShapeImpl<IShapeCircle> {
  public:
    using Interfaces = InterfaceMap<IShapeCircle, IPatternPointFilter, ISupportErrorInfo>;

    CShapeCircle();

    // IShapeCircle
    HRESULT get_Center(ICoordinateFloat** value) override;
    HRESULT put_Center(ICoordinateFloat* value) override;
    HRESULT get_InnerRadius(double* value) override;
    HRESULT put_InnerRadius(double value) override;
    HRESULT get_OuterRadius(double* value) override;
    HRESULT put_OuterRadius(double value) override;

    // Compares squared distances, so the test is made in the shape's relative coordinates: with unequal
    // DAC ranges the excluded area is an ellipse in DAC terms.
    bool Contains(coordinate<double> point) override;

  protected:
    void CopyShapeTo(IShape* target) override;

  private:
    HRESULT PutRadius(double value, double CircleShapeGeometry::*field, const char* failure);
    CircleShapeGeometry StoredGeometry();

    ObjectMutex fieldMutex_;
    CircleShapeGeometry circle_;
};

} // namespace Norvane::Lumis::Scanning

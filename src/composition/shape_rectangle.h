// An exclusion rectangle: the points between its left and right and its top and bottom edges, all four
// edges included.
#pragma once

#include "composition/shape_impl.h"

namespace Norvane::Lumis::Scanning {

class CShapeRectangle : public ShapeImpl<IShapeRectangle> {
  public:
    using Interfaces = InterfaceMap<IShapeRectangle, IPatternPointFilter, ISupportErrorInfo>;

    CShapeRectangle();

    // IShapeRectangle
    HRESULT get_Rectangle(IRectangleFloat** value) override;
    HRESULT put_Rectangle(IRectangleFloat* value) override;

    bool Contains(coordinate<double> point) override;

  protected:
    void CopyShapeTo(IShape* target) override;

  private:
    RectangleFloat StoredRectangle();

    ObjectMutex fieldMutex_;
    RectangleFloat rectangle_;
};

} // namespace Norvane::Lumis::Scanning

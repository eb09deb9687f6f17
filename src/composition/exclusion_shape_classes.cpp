#include "composition/exclusion_shape_classes.h"

#include "composition/shape_circle.h"
#include "composition/shape_polygon.h"
#include "composition/shape_rectangle.h"
#include "module/class_creator.h"

namespace Norvane::Lumis::Scanning {

std::vector<ClassEntry> ExclusionShapeClassEntries() {
    return {
        {CLSID_ShapeRectangle, "ShapeRectangle", "Beamweaver.ShapeRectangle", ThreadingModel::Free,
         &CreateComObject<CShapeRectangle>},
        {CLSID_ShapeCircle, "ShapeCircle", "Beamweaver.ShapeCircle", ThreadingModel::Free,
         &CreateComObject<CShapeCircle>},
        {CLSID_ShapePolygon, "ShapePolygon", "Beamweaver.ShapePolygon", ThreadingModel::Free,
         &CreateComObject<CShapePolygon>},
    };
}

} // namespace Norvane::Lumis::Scanning

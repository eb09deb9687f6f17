#include "shapes/polygon_classes.h"

#include "module/class_creator.h"
#include "shapes/pattern_polygon.h"

namespace Norvane::Lumis::Scanning {

std::vector<ClassEntry> PolygonClassEntries() {
    return {
        {CLSID_PatternPolygon, "PatternPolygon", "Beamweaver.PatternPolygon", ThreadingModel::Free,
         &CreateComObject<CPatternPolygon>},
    };
}

} // namespace Norvane::Lumis::Scanning

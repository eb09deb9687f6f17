#include "shapes/shape_classes.h"

#include "module/class_creator.h"
#include "shapes/pattern_line.h"
#include "shapes/pattern_rectangle.h"

namespace Norvane::Lumis::Scanning {

std::vector<ClassEntry> ShapeClassEntries() {
    return {
        {CLSID_PatternRectangle, "PatternRectangle", "Beamweaver.PatternRectangle", ThreadingModel::Free,
         &CreateComObject<CPatternRectangle>},
        {CLSID_PatternLine, "PatternLine", "Beamweaver.PatternLine", ThreadingModel::Free,
         &CreateComObject<CPatternLine>},
    };
}

} // namespace Norvane::Lumis::Scanning

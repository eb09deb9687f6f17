#include "shapes/shape_classes.h"

#include "module/class_creator.h"
#include "shapes/pattern_line.h"

namespace Norvane::Lumis::Scanning {

std::vector<ClassEntry> ShapeClassEntries() {
    return {
        {CLSID_PatternLine, "PatternLine", "Beamweaver.PatternLine", ThreadingModel::Free,
         &CreateComObject<CPatternLine>},
    };
}

} // namespace Norvane::Lumis::Scanning

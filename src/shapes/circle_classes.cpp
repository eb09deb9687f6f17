#include "shapes/circle_classes.h"

#include "module/class_creator.h"
#include "shapes/pattern_circle.h"

namespace Norvane::Lumis::Scanning {

std::vector<ClassEntry> CircleClassEntries() {
    return {
        {CLSID_PatternCircle, "PatternCircle", "Beamweaver.PatternCircle", ThreadingModel::Free,
         &CreateComObject<CPatternCircle>},
    };
}

} // namespace Norvane::Lumis::Scanning

#include "composition/exclusion_zone_classes.h"

#include "composition/exclusion_zone.h"
#include "module/class_creator.h"

namespace Norvane::Lumis::Scanning {

std::vector<ClassEntry> ExclusionZoneClassEntries() {
    return {
        {CLSID_ExclusionZone, "ExclusionZone", "Beamweaver.ExclusionZone", ThreadingModel::Free,
         &CreateComObject<CExclusionZone>},
    };
}

} // namespace Norvane::Lumis::Scanning

#include "core/strategy_classes.h"

#include "core/scan_strategy_circular.h"
#include "core/scan_strategy_raster.h"
#include "core/scan_strategy_rectangular.h"
#include "module/class_creator.h"

#include <string>

namespace Norvane::Lumis::Scanning {

namespace {

template <class T> ClassEntry EntryFor(REFCLSID clsid, const char* name) {
    return {clsid, name, std::string("Beamweaver.") + name, ThreadingModel::Free, &CreateComObject<T>};
}

} // namespace

std::vector<ClassEntry> StrategyClassEntries() {
    return {
        EntryFor<CScanStrategyRaster>(CLSID_ScanStrategyRaster, "ScanStrategyRaster"),
        EntryFor<CScanStrategyRectangular>(CLSID_ScanStrategyRectangular, "ScanStrategyRectangular"),
        EntryFor<CScanStrategyCircular>(CLSID_ScanStrategyCircular, "ScanStrategyCircular"),
    };
}

} // namespace Norvane::Lumis::Scanning

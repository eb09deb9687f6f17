#include "module/class_table.h"

#include "composition/exclusion_shape_classes.h"
#include "composition/exclusion_zone_classes.h"
#include "comtypes/comtypes_registration.h"
#include "core/rendering_classes.h"
#include "core/strategy_classes.h"
#include "dwellmap/dwellmap_registration.h"
#include "platform/module_lock.h"
#include "shapes/circle_classes.h"
#include "shapes/polygon_classes.h"
#include "shapes/shape_classes.h"

#include <beamweaver/identifiers.h>

#include <algorithm>
#include <iterator>
#include <mutex>

namespace Norvane::Lumis::Scanning {

namespace {

// The published order of the library's classes; registration follows it.
constexpr const CLSID* kTableOrder[] = {
    &CLSID_RasterScan,
    &CLSID_RasterAlignments,
    &CLSID_PatternAlignments,
    &CLSID_RasterRenderingProperties,
    &CLSID_PatternRenderingProperties,
    &CLSID_PatternRectangle,
    &CLSID_PatternCircle,
    &CLSID_PatternLine,
    &CLSID_PatternSpot,
    &CLSID_PatternSpotList,
    &CLSID_BeamweaverElement,
    &CLSID_BeamweaverCollection,
    &CLSID_PatternStreamFile,
    &CLSID_PatternBitmapFile,
    &CLSID_PatternRawMillPoints,
    &CLSID_PatternFactory,
    &CLSID_PatternPolygon,
    &CLSID_PatternRegularCrossSection,
    &CLSID_PatternMultiPassCrossSection,
    &CLSID_ScanStrategyRaster,
    &CLSID_ScanStrategyRectangular,
    &CLSID_ScanStrategyCircular,
    &CLSID_ExclusionZone,
    &CLSID_ShapeRectangle,
    &CLSID_ShapeCircle,
    &CLSID_ShapePolygon,
    &CLSID_EelsRaster,
    &CLSID_PatternStep,
    &CLSID_PatternWobble,
    &CLSID_SqtRaster,
    &CLSID_PatternSpotListItem,
    &CLSID_PatternSpotList2,
};

std::size_t TablePosition(const ClassEntry& entry) {
    const auto* found = std::find_if(std::begin(kTableOrder), std::end(kTableOrder),
                                     [&](const CLSID* clsid) { return *clsid == entry.clsid; });
    return static_cast<std::size_t>(found - std::begin(kTableOrder));
}

std::vector<ClassEntry> BuildClassTable() {
    std::vector<ClassEntry> table;
    for (auto part :
         {RenderingClassEntries(), StrategyClassEntries(), ShapeClassEntries(), CircleClassEntries(),
          PolygonClassEntries(), ExclusionZoneClassEntries(), ExclusionShapeClassEntries()})
        table.insert(table.end(), part.begin(), part.end());
    std::stable_sort(table.begin(), table.end(), [](const ClassEntry& a, const ClassEntry& b) {
        return TablePosition(a) < TablePosition(b);
    });
    return table;
}

} // namespace

const std::vector<ClassEntry>& BeamweaverClassTable() {
    static const std::vector<ClassEntry> table = BuildClassTable();
    return table;
}

HRESULT DllRegisterServer() {
    RegisterClasses(BeamweaverClassTable());
    return S_OK;
}

HRESULT DllUnregisterServer() {
    UnregisterClasses(BeamweaverClassTable());
    return S_OK;
}

HRESULT DllCanUnloadNow() {
    return ModuleLockCount() == 0 ? S_OK : S_FALSE;
}

HRESULT DllGetClassObject(REFCLSID clsid, REFIID riid, void** out) {
    if (out == nullptr)
        return E_POINTER;
    *out = nullptr;
    // One factory per class, made on first request and kept for the life of the module; factories do
    // not hold the module, so a client keeping one does not keep the module loaded.
    static std::mutex mutex;
    static std::vector<CComPtr<IUnknown>> factories(BeamweaverClassTable().size());
    const auto& table = BeamweaverClassTable();
    for (std::size_t i = 0; i < table.size(); ++i) {
        if (!(table[i].clsid == clsid))
            continue;
        std::lock_guard lock(mutex);
        if (!factories[i]) {
            const HRESULT hr =
                GetClassFactory(table[i], IUnknown::iid, reinterpret_cast<void**>(&factories[i]));
            if (FAILED(hr))
                return hr;
        }
        return factories[i]->QueryInterface(riid, out);
    }
    return CLASS_E_CLASSNOTAVAILABLE;
}

void RegisterComponents() {
    RegisterComTypesClasses();
    RegisterDwellmapClasses();
    DllRegisterServer();
}

} // namespace Norvane::Lumis::Scanning

#include "module/class_table.h"

#include "comtypes/comtypes_registration.h"
#include "composition/exclusion_shape_classes.h"
#include "composition/exclusion_zone_classes.h"
#include "core/rendering_classes.h"
#include "core/strategy_classes.h"
#include "dwellmap/dwellmap_registration.h"
#include "platform/module_lock.h"

#include <mutex>
#include "shapes/shape_classes.h"

namespace Norvane::Lumis::Scanning {

namespace {

std::vector<ClassEntry> BuildClassTable() {
    std::vector<ClassEntry> table;
    for (auto part : {RenderingClassEntries(), StrategyClassEntries(), ShapeClassEntries(), ExclusionZoneClassEntries(),
                       ExclusionShapeClassEntries()})
        table.insert(table.end(), part.begin(), part.end());
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

HRESULT DllCanUnloadNow() { return ModuleLockCount() == 0 ? S_OK : S_FALSE; }

HRESULT DllGetClassObject(REFCLSID clsid, REFIID riid, void** out) {
    if (out == nullptr) return E_POINTER;
    *out = nullptr;
    // One factory per class, made on first request and kept for the life of the module; factories do
    // not hold the module, so a client keeping one does not keep the module loaded.
    static std::mutex mutex;
    static std::vector<CComPtr<IUnknown>> factories(BeamweaverClassTable().size());
    const auto& table = BeamweaverClassTable();
    for (std::size_t i = 0; i < table.size(); ++i) {
        if (!(table[i].clsid == clsid)) continue;
        std::lock_guard lock(mutex);
        if (!factories[i]) {
            const HRESULT hr = GetClassFactory(table[i], IUnknown::iid, reinterpret_cast<void**>(&factories[i]));
            if (FAILED(hr)) return hr;
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

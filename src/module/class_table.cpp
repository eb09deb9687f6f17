#include "module/class_table.h"

#include "comtypes/comtypes_registration.h"
#include "core/rendering_classes.h"
#include "dwellmap/dwellmap_registration.h"
#include "platform/module_lock.h"
#include "shapes/shape_classes.h"

namespace Norvane::Lumis::Scanning {

namespace {

std::vector<ClassEntry> BuildClassTable() {
    std::vector<ClassEntry> table;
    for (auto part : {RenderingClassEntries(), ShapeClassEntries()})
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
    for (const ClassEntry& entry : BeamweaverClassTable())
        if (entry.clsid == clsid) return GetClassFactory(entry, riid, out);
    return CLASS_E_CLASSNOTAVAILABLE;
}

void RegisterComponents() {
    RegisterComTypesClasses();
    RegisterDwellmapClasses();
    DllRegisterServer();
}

} // namespace Norvane::Lumis::Scanning

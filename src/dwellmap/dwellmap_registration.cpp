#include "dwellmap/dwellmap_registration.h"

#include "dwellmap/pattern_point_list.h"
#include "dwellmap/sub_pattern_collection.h"
#include "module/method_guard.h"

namespace {

// The class factory's creator: nothing thrown while building the object leaves it (an allocation
// failure becomes E_OUTOFMEMORY).
template <class T> HRESULT CreateObject(IUnknown* outer, REFIID riid, void** out) {
    return Norvane::Guarded(IClassFactory::iid,
                            [&] { return ComCreator<T>::CreateInstance(outer, riid, out); });
}

} // namespace

std::vector<ClassEntry> DwellmapClassEntries() {
    using namespace Norvane::Dwellmap;
    return {
        {CLSID_PatternPointList, "PatternPointList", "Dwellmap.PatternPointList", ThreadingModel::Free,
         &CreateObject<CPatternPointList>},
        {CLSID_SubPatternCollection, "SubPatternCollection", "Dwellmap.SubPatternCollection",
         ThreadingModel::Free, &CreateObject<CSubPatternCollection>},
    };
}

void RegisterDwellmapClasses() {
    RegisterClasses(DwellmapClassEntries());
}

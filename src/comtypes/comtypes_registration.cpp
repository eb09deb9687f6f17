#include "comtypes/comtypes_registration.h"

#include "comtypes/coordinate_float.h"
#include "comtypes/range_int.h"
#include "comtypes/rectangle_float.h"
#include "comtypes/rectangle_int.h"
#include "comtypes/size_2d_int.h"
#include "comtypes/transformation_matrix_2d.h"

namespace {

using namespace Norvane::ComTypes;

// The class factory's creator: nothing thrown while building the object leaves it (an allocation
// failure becomes E_OUTOFMEMORY).
template <class T> HRESULT CreateValueObject(IUnknown* outer, REFIID riid, void** out) {
    return Norvane::Guarded(IClassFactory::iid,
                            [&] { return ComCreator<T>::CreateInstance(outer, riid, out); });
}

template <class T> ClassEntry EntryFor(REFCLSID clsid, const char* name) {
    return {clsid, name, std::string("NorvaneComTypes.") + name, ThreadingModel::Free, &CreateValueObject<T>};
}

struct DefaultClass {
    IID iid;
    CLSID clsid;
};

constexpr DefaultClass kDefaultClasses[] = {
    {IID_ICoordinateFloat, CLSID_CoordinateFloat},
    {IID_IRectangleFloat, CLSID_RectangleFloat},
    {IID_IRectangleInt, CLSID_RectangleInt},
    {IID_IRangeInt, CLSID_RangeInt},
    {IID_ISize2DInt, CLSID_Size2DInt},
    {IID_ITransformationMatrix2D, CLSID_TransformationMatrix2D},
};

} // namespace

std::vector<ClassEntry> ComTypesClassEntries() {
    return {
        EntryFor<CCoordinateFloat>(CLSID_CoordinateFloat, "CoordinateFloat"),
        EntryFor<CRectangleFloat>(CLSID_RectangleFloat, "RectangleFloat"),
        EntryFor<CRectangleInt>(CLSID_RectangleInt, "RectangleInt"),
        EntryFor<CRangeInt>(CLSID_RangeInt, "RangeInt"),
        EntryFor<CSize2DInt>(CLSID_Size2DInt, "Size2DInt"),
        EntryFor<CTransformationMatrix2D>(CLSID_TransformationMatrix2D, "TransformationMatrix2D"),
    };
}

void RegisterComTypesClasses() {
    RegisterClasses(ComTypesClassEntries());
    for (const auto& entry : kDefaultClasses)
        RegisterDefaultClass(entry.iid, entry.clsid);
}

// The creator a class-table entry wraps: builds one object of class T, stand-alone or aggregated, and
// lets nothing thrown while building it escape. An exception becomes its HRESULT plus error information
// reported against the class factory (an allocation failure becomes E_OUTOFMEMORY).
#pragma once

#include "module/method_guard.h"
#include "platform/class_factory.h"
#include "platform/object.h"

namespace Norvane {

template <class T> HRESULT CreateComObject(IUnknown* outer, REFIID riid, void** out) {
    return Guarded(IClassFactory::iid, [&] { return ComCreator<T>::CreateInstance(outer, riid, out); });
}

} // namespace Norvane

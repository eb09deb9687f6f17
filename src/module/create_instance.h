// Creating objects of other components (and of the library's own classes) by class identifier.
#pragma once

#include "module/hresult_exception.h"
#include "platform/class_factory.h"

#include <string>

namespace Norvane {

// "CoCreateInstance({D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1})": the identifier in registry form.
std::u16string CreationFailureText(REFCLSID clsid);

// Throws HResultException(hr) with CreationFailureText as both source and description, so the client
// sees which creation failed as the message and as the origin.
[[noreturn]] void ThrowCreationFailure(HRESULT hr, REFCLSID clsid);

// Creates an object of the class with interface I (in any class context). A failed creation throws
// as ThrowCreationFailure says, with the creation's HRESULT.
template <class I> CComPtr<I> CreateInstance(REFCLSID clsid) {
    CComPtr<I> result;
    const HRESULT hr =
        CoCreateInstance(clsid, nullptr, CLSCTX_ALL, I::iid, reinterpret_cast<void**>(&result));
    if (FAILED(hr))
        ThrowCreationFailure(hr, clsid);
    return result;
}

} // namespace Norvane

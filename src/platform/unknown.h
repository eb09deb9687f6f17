// The root interface of every object: identity, reference counting and interface lookup.
#pragma once

#include "platform/guid.h"

struct IUnknown {
    static constexpr IID iid = MakeGuid("00000000-0000-0000-C000-000000000046");

    virtual HRESULT QueryInterface(REFIID riid, void** out) = 0;
    virtual ULONG AddRef() = 0;
    virtual ULONG Release() = 0;

  protected:
    // Objects are destroyed by their last Release, never through an interface pointer.
    virtual ~IUnknown() = default;
};

// Interfaces name their immediate base interface so that an interface map can answer the whole chain.
template <class I>
concept HasBaseInterface = requires {
    typename I::BaseInterface;
};

// Whether an identifier names I or one of the interfaces it derives from.
template <class I> constexpr bool ImplementsInterface(REFIID riid) {
    if (riid == I::iid)
        return true;
    if constexpr (HasBaseInterface<I>)
        return ImplementsInterface<typename I::BaseInterface>(riid);
    else
        return false;
}

// Enumeration of a collection's elements as automation values, and an enumerator over a container.
#pragma once

#include "platform/object.h"
#include "platform/variant.h"

#include <algorithm>
#include <cstddef>
#include <mutex>
#include <new>
#include <utility>

struct IEnumVARIANT : IUnknown {
    using BaseInterface = IUnknown;
    static constexpr IID iid = MakeGuid("00020404-0000-0000-C000-000000000046");

    // Writes up to count elements into values (each a new value the caller clears) and moves past them.
    // S_OK when all count were fetched, S_FALSE when the end came first. fetched may be null only when
    // count is 1, values only when it is 0. A failed copy hands out nothing, keeps the position and
    // returns its HRESULT.
    virtual HRESULT Next(ULONG count, VARIANT* values, ULONG* fetched) = 0;
    // Moves past count elements; S_FALSE when the end came first (the position is then the end).
    virtual HRESULT Skip(ULONG count) = 0;
    virtual HRESULT Reset() = 0;
    // A new enumerator over the same elements that starts at this one's position.
    virtual HRESULT Clone(IEnumVARIANT** out) = 0;

  protected:
    ~IEnumVARIANT() = default;
};

// An enumerator over an object's container that walks its current contents by index, so elements
// added or removed between calls are seen and nothing dangles. It holds a reference to the container's
// owner, which keeps the container alive. It does not lock the container: the owner must not change
// it while another thread enumerates.
//
// Container: size() and operator[](std::size_t), as std::vector.
// CopyPolicy: static HRESULT Copy(VARIANT* destination, const Container::value_type& element) noexcept;
//   the destination arrives empty and must be left empty on failure.
template <class Container, class CopyPolicy>
class CEnumVariant : public CComObjectRootBase, public IEnumVARIANT {
    using Element = typename Container::value_type;
    static_assert(noexcept(CopyPolicy::Copy(std::declval<VARIANT*>(), std::declval<const Element&>())),
                  "the copy policy reports failures as HRESULT and never throws");

  public:
    using Interfaces = InterfaceMap<IEnumVARIANT>;

    CEnumVariant(IUnknown* owner, const Container& container, std::size_t position = 0)
        : owner_(owner), container_(container), position_(position) {}

    HRESULT Next(ULONG count, VARIANT* values, ULONG* fetched) override {
        if ((values == nullptr && count != 0) || (fetched == nullptr && count != 1))
            return E_POINTER;
        if (fetched != nullptr)
            *fetched = 0;
        std::lock_guard lock(mutex_);
        const ULONG available = static_cast<ULONG>(std::min<std::size_t>(count, Remaining()));
        for (ULONG i = 0; i < available; ++i) {
            VariantInit(&values[i]);
            const HRESULT hr = CopyPolicy::Copy(&values[i], container_[position_ + i]);
            if (FAILED(hr)) {
                ClearValues(values, i);
                return hr;
            }
        }
        position_ += available;
        if (fetched != nullptr)
            *fetched = available;
        return available == count ? S_OK : S_FALSE;
    }

    HRESULT Skip(ULONG count) override {
        std::lock_guard lock(mutex_);
        const std::size_t remaining = Remaining();
        position_ += std::min<std::size_t>(count, remaining);
        return count <= remaining ? S_OK : S_FALSE;
    }

    HRESULT Reset() override {
        std::lock_guard lock(mutex_);
        position_ = 0;
        return S_OK;
    }

    HRESULT Clone(IEnumVARIANT** out) override {
        if (out == nullptr)
            return E_POINTER;
        std::lock_guard lock(mutex_);
        auto* clone = new (std::nothrow) CComObject<CEnumVariant>(owner_.Get(), container_, position_);
        *out = clone;
        if (clone == nullptr)
            return E_OUTOFMEMORY;
        clone->AddRef();
        return S_OK;
    }

  private:
    std::size_t Remaining() const {
        const std::size_t size = container_.size();
        return position_ < size ? size - position_ : 0;
    }

    static void ClearValues(VARIANT* values, ULONG count) {
        for (ULONG i = 0; i < count; ++i)
            VariantClear(&values[i]);
    }

    CComPtr<IUnknown> owner_;
    const Container& container_;
    std::mutex mutex_;
    std::size_t position_;
};

// A new enumerator over container, which owner (null for a container that outlives every enumerator)
// keeps alive. Failures are thrown, as by every internal creation.
template <class CopyPolicy, class Container>
CComPtr<IEnumVARIANT> CreateEnumVariant(IUnknown* owner, const Container& container) {
    return Norvane::CComObjectEx<CEnumVariant<Container, CopyPolicy>>::template CreateInstance<IEnumVARIANT>(
        owner, container);
}

// Object templates: reference counting, interface lookup, aggregation and creation.
//
// A class derives from its interfaces and from CComObjectRootBase, and declares its interface map:
//
//     class CPatternLine : public CComObjectRootBase, public IDispatchImpl<IPatternLine>, ... {
//     public:
//         using Interfaces = InterfaceMap<IPatternLine, IExclusionAwarePattern, ...>;
//     };
//
// The templates below supply IUnknown. Every live object holds one count on the module lock.
#pragma once

#include "platform/com_error.h"
#include "platform/interface_map.h"
#include "platform/module_lock.h"

#include <atomic>
#include <new>
#include <utility>

class CComObjectRootBase {
  public:
    // Second construction step, run once the object is counted; a failure destroys the object.
    HRESULT FinalConstruct() { return S_OK; }
    void FinalRelease() {}
};

namespace platform_detail {

class RefCount {
  public:
    ULONG Increment() { return count_.fetch_add(1, std::memory_order_relaxed) + 1; }
    // Returns the new count; the thread that sees zero owns the destruction.
    ULONG Decrement() { return count_.fetch_sub(1, std::memory_order_acq_rel) - 1; }

  private:
    std::atomic<ULONG> count_{0};
};

template <class T> HRESULT QueryFromMap(T* object, REFIID riid, void** out) {
    if (out == nullptr)
        return E_POINTER;
    *out = T::Interfaces::Find(object, riid);
    if (*out == nullptr)
        return E_NOINTERFACE;
    static_cast<IUnknown*>(*out)->AddRef();
    return S_OK;
}

} // namespace platform_detail

// A stand-alone object.
template <class T> class CComObject final : public T {
  public:
    template <class... Args> explicit CComObject(Args&&... args) : T(std::forward<Args>(args)...) {
        ModuleLockIncrement();
    }
    ~CComObject() {
        T::FinalRelease();
        ModuleLockDecrement();
    }
    CComObject(const CComObject&) = delete;
    CComObject& operator=(const CComObject&) = delete;

    HRESULT QueryInterface(REFIID riid, void** out) override {
        return platform_detail::QueryFromMap<T>(this, riid, out);
    }
    ULONG AddRef() override { return refs_.Increment(); }
    ULONG Release() override {
        const ULONG left = refs_.Decrement();
        if (left == 0)
            delete this;
        return left;
    }

    IUnknown* Identity() { return T::Interfaces::Identity(static_cast<T*>(this)); }

  private:
    platform_detail::RefCount refs_;
};

// An object that does not hold the module: for platform-owned objects such as error information,
// which may outlive every object of the module in a thread's slot.
template <class T> class CComObjectNoLock final : public T {
  public:
    template <class... Args> explicit CComObjectNoLock(Args&&... args) : T(std::forward<Args>(args)...) {}
    ~CComObjectNoLock() { T::FinalRelease(); }
    CComObjectNoLock(const CComObjectNoLock&) = delete;
    CComObjectNoLock& operator=(const CComObjectNoLock&) = delete;

    HRESULT QueryInterface(REFIID riid, void** out) override {
        return platform_detail::QueryFromMap<T>(this, riid, out);
    }
    ULONG AddRef() override { return refs_.Increment(); }
    ULONG Release() override {
        const ULONG left = refs_.Decrement();
        if (left == 0)
            delete this;
        return left;
    }

  private:
    platform_detail::RefCount refs_;
};

// The inner object of an aggregate: its interfaces delegate identity and lifetime to the outer object.
template <class T> class CComContainedObject final : public T {
  public:
    template <class... Args>
    explicit CComContainedObject(IUnknown* outer, Args&&... args)
        : T(std::forward<Args>(args)...), outer_(outer) {}

    HRESULT QueryInterface(REFIID riid, void** out) override { return outer_->QueryInterface(riid, out); }
    ULONG AddRef() override { return outer_->AddRef(); }
    ULONG Release() override { return outer_->Release(); }

    HRESULT QueryOwnInterface(REFIID riid, void** out) {
        return platform_detail::QueryFromMap<T>(this, riid, out);
    }

  private:
    IUnknown* outer_;
};

// An aggregated object: this IUnknown is the inner, non-delegating one that the outer object keeps.
template <class T> class CComAggObject final : public IUnknown {
  public:
    template <class... Args>
    explicit CComAggObject(IUnknown* outer, Args&&... args) : contained_(outer, std::forward<Args>(args)...) {
        ModuleLockIncrement();
    }
    ~CComAggObject() {
        contained_.FinalRelease();
        ModuleLockDecrement();
    }
    CComAggObject(const CComAggObject&) = delete;
    CComAggObject& operator=(const CComAggObject&) = delete;

    HRESULT QueryInterface(REFIID riid, void** out) override {
        if (out == nullptr)
            return E_POINTER;
        if (riid == IUnknown::iid) {
            *out = static_cast<IUnknown*>(this);
            AddRef();
            return S_OK;
        }
        return contained_.QueryOwnInterface(riid, out);
    }
    ULONG AddRef() override { return refs_.Increment(); }
    ULONG Release() override {
        const ULONG left = refs_.Decrement();
        if (left == 0)
            delete this;
        return left;
    }

    HRESULT FinalConstruct() { return contained_.FinalConstruct(); }

  private:
    platform_detail::RefCount refs_;
    CComContainedObject<T> contained_;
};

// Creation as a class factory does it: stand-alone, or aggregated when outer is given (then only
// IUnknown may be asked for). Exceptions thrown by the constructor pass through to the caller after
// the half-built object has been freed; the caller's boundary translates them.
template <class T> struct ComCreator {
    template <class... Args>
    static HRESULT CreateInstance(IUnknown* outer, REFIID riid, void** out, Args&&... args) {
        if (out == nullptr)
            return E_POINTER;
        *out = nullptr;
        if (outer != nullptr && !(riid == IUnknown::iid))
            return CLASS_E_NOAGGREGATION;
        if (outer != nullptr)
            return Finish(new CComAggObject<T>(outer, std::forward<Args>(args)...), riid, out);
        return Finish(new CComObject<T>(std::forward<Args>(args)...), riid, out);
    }

  private:
    // Holds one reference through the final construction and the query, so any failure frees it.
    template <class Object> static HRESULT Finish(Object* object, REFIID riid, void** out) {
        object->AddRef();
        HRESULT hr = object->FinalConstruct();
        if (SUCCEEDED(hr))
            hr = object->QueryInterface(riid, out);
        object->Release();
        return hr;
    }
};

namespace Norvane {

// Internal creation with constructor arguments. The new object is held at one reference from the
// moment it is built, so a failure of the final construction or of the query destroys it cleanly;
// a constructor that throws leaves nothing behind. Failures are thrown as ComError.
template <class T> class CComObjectEx {
  public:
    template <class I, class... Args> static CComPtr<I> CreateInstance(Args&&... args) {
        CComPtr<I> result;
        const HRESULT hr = ComCreator<T>::CreateInstance(nullptr, I::iid, reinterpret_cast<void**>(&result),
                                                         std::forward<Args>(args)...);
        if (FAILED(hr))
            throw ComError(hr);
        return result;
    }
};

} // namespace Norvane

// Owning smart pointer for interface references.
#pragma once

#include "platform/unknown.h"

#include <utility>

template <class T> class CComPtr {
  public:
    CComPtr() = default;
    CComPtr(std::nullptr_t) {}
    CComPtr(T* p) : p_(p) {
        if (p_)
            p_->AddRef();
    }
    CComPtr(const CComPtr& other) : CComPtr(other.p_) {}
    CComPtr(CComPtr&& other) noexcept : p_(std::exchange(other.p_, nullptr)) {}
    ~CComPtr() { Release(); }

    CComPtr& operator=(const CComPtr& other) {
        CComPtr(other).Swap(*this);
        return *this;
    }
    CComPtr& operator=(CComPtr&& other) noexcept {
        CComPtr(std::move(other)).Swap(*this);
        return *this;
    }
    CComPtr& operator=(T* p) {
        CComPtr(p).Swap(*this);
        return *this;
    }

    T* operator->() const { return p_; }
    T& operator*() const { return *p_; }
    operator T*() const { return p_; }
    explicit operator bool() const { return p_ != nullptr; }
    T* Get() const { return p_; }

    // Address for an out parameter; the pointer must be empty, as a filled one would leak.
    T** operator&() { return &p_; }

    void Release() {
        if (auto* p = std::exchange(p_, nullptr))
            p->Release();
    }
    void Attach(T* p) {
        Release();
        p_ = p;
    }
    T* Detach() { return std::exchange(p_, nullptr); }

    // Hands a new reference to an out parameter.
    HRESULT CopyTo(T** out) const {
        if (out == nullptr)
            return E_POINTER;
        *out = p_;
        if (p_)
            p_->AddRef();
        return S_OK;
    }

    template <class Q> HRESULT QueryInterface(Q** out) const {
        if (out == nullptr)
            return E_POINTER;
        *out = nullptr;
        if (p_ == nullptr)
            return E_POINTER;
        return p_->QueryInterface(Q::iid, reinterpret_cast<void**>(out));
    }

    void Swap(CComPtr& other) noexcept { std::swap(p_, other.p_); }

  private:
    T* p_ = nullptr;
};

// Queries an interface and returns it owned; empty when the object does not answer it.
template <class Q, class T> CComPtr<Q> QueryAs(T* object) {
    CComPtr<Q> result;
    if (object != nullptr)
        object->QueryInterface(Q::iid, reinterpret_cast<void**>(&result));
    return result;
}

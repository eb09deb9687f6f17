// One property of a value object: a field that any thread may read or write without a lock. Each get
// and put is a single atomic load or store, so a reader never sees a torn value; every value is accepted.
#pragma once

#include "module/method_guard.h"

#include <atomic>

namespace Norvane::ComTypes {

template <class T> class ValueProperty {
    static_assert(std::atomic<T>::is_always_lock_free, "value properties must not need a lock");

  public:
    explicit ValueProperty(T initial = T{}) : value_(initial) {}

    // riid names the interface whose getter is called; a null out pointer gives E_POINTER.
    HRESULT Get(REFIID riid, T* out) const {
        return Guarded(riid, out, [&] { *out = value_.load(std::memory_order_relaxed); });
    }
    HRESULT Put(T value) {
        value_.store(value, std::memory_order_relaxed);
        return S_OK;
    }

  private:
    std::atomic<T> value_;
};

} // namespace Norvane::ComTypes

// One property of a value object (alignments, rendering properties): a field that any thread may read or
// write without a lock. Every load and store is one atomic access, so a reader sees a value either
// before or after a put, never a torn one, and the objects need no mutex. The value is kept as an
// unsigned integer of its size, so that records such as an integer range (two int32) are one plain
// 64-bit access on every compiler instead of a call into an atomics library.
#pragma once

#include "module/method_guard.h"

#include <atomic>
#include <bit>
#include <cstdint>
#include <type_traits>

namespace Norvane::Lumis::Scanning {

namespace value_field_detail {

template <std::size_t Size> struct BitsOfSize;
template <> struct BitsOfSize<4> { using type = std::uint32_t; };
template <> struct BitsOfSize<8> { using type = std::uint64_t; };

} // namespace value_field_detail

template <class T> class ValueField {
    static_assert(std::is_trivially_copyable_v<T>, "value fields hold plain values");
    using Bits = typename value_field_detail::BitsOfSize<sizeof(T)>::type;
    static_assert(std::atomic<Bits>::is_always_lock_free, "value fields must not need a lock");

  public:
    explicit ValueField(T initial) : bits_(std::bit_cast<Bits>(initial)) {}

    T Load() const { return std::bit_cast<T>(bits_.load(std::memory_order_relaxed)); }
    void Store(T value) { bits_.store(std::bit_cast<Bits>(value), std::memory_order_relaxed); }

    // The getter of a property of interface riid: E_POINTER for a null out pointer.
    HRESULT Get(REFIID riid, T* out) const {
        return Guarded(riid, out, [&] { *out = Load(); });
    }

    // The setter of a plain value: a value that accepts refuses gives E_INVALIDARG without a message
    // and leaves the stored value as it was.
    template <class Accepts> HRESULT Put(REFIID riid, T value, Accepts accepts) {
        return Guarded(riid, [&] {
            if (!accepts(value))
                return E_INVALIDARG;
            Store(value);
            return S_OK;
        });
    }

  private:
    std::atomic<Bits> bits_;
};

// Acceptance rules of the plain-value setters. Written so that NaN is refused wherever a bound applies.
inline bool IsPositive(double value) {
    return value > 0.0;
}
inline bool IsNotNegative(double value) {
    return value >= 0.0;
}
template <class T> bool IsAnyValue(T) {
    return true;
}

} // namespace Norvane::Lumis::Scanning

// Plain geometry records held inside objects and passed to the point generators (copied by value).
#pragma once

#include <cstdint>

namespace Norvane::Lumis {

template <class T>
struct coordinate {
    T x{};
    T y{};
    friend constexpr bool operator==(const coordinate&, const coordinate&) = default;
};

struct RectangleFloat {
    double left{};
    double top{};
    double right{};
    double bottom{};
    friend constexpr bool operator==(const RectangleFloat&, const RectangleFloat&) = default;
};

struct RectangleInt {
    std::int32_t left{};
    std::int32_t top{};
    std::int32_t right{};
    std::int32_t bottom{};
    friend constexpr bool operator==(const RectangleInt&, const RectangleInt&) = default;
};

struct RangeInt {
    std::int32_t minimum{};
    std::int32_t maximum{};
    friend constexpr bool operator==(const RangeInt&, const RangeInt&) = default;
};

struct SizeInt {
    std::int32_t width{};
    std::int32_t height{};
    friend constexpr bool operator==(const SizeInt&, const SizeInt&) = default;
};

// Maps (x, y) to (m0·x + m1·y + m2, m3·x + m4·y + m5); the default is the identity.
struct TransformationMatrix {
    double m0 = 1.0;
    double m1 = 0.0;
    double m2 = 0.0;
    double m3 = 0.0;
    double m4 = 1.0;
    double m5 = 0.0;
    friend constexpr bool operator==(const TransformationMatrix&, const TransformationMatrix&) = default;
};

} // namespace Norvane::Lumis

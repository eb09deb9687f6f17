// 128-bit identifiers of interfaces and classes, parsed at compile time from their text form.
#pragma once

#include "platform/com_types.h"

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

struct GUID {
    std::uint32_t Data1;
    std::uint16_t Data2;
    std::uint16_t Data3;
    std::uint8_t Data4[8];

    friend constexpr bool operator==(const GUID& a, const GUID& b) {
        if (a.Data1 != b.Data1 || a.Data2 != b.Data2 || a.Data3 != b.Data3)
            return false;
        for (int i = 0; i < 8; ++i)
            if (a.Data4[i] != b.Data4[i])
                return false;
        return true;
    }
};

using IID = GUID;
using CLSID = GUID;
using REFIID = const IID&;
using REFCLSID = const CLSID&;

namespace platform_detail {

constexpr int HexDigit(char c) {
    if (c >= '0' && c <= '9')
        return c - '0';
    if (c >= 'a' && c <= 'f')
        return c - 'a' + 10;
    if (c >= 'A' && c <= 'F')
        return c - 'A' + 10;
    return -1;
}

// Parses "XXXXXXXX-XXXX-XXXX-XXXX-XXXXXXXXXXXX", with or without braces. Returns nothing for any
// other text, so a stray character can never turn into a silently different identifier.
constexpr std::optional<GUID> ParseGuid(std::string_view text) {
    if (text.size() == 38) {
        if (text.front() != '{' || text.back() != '}')
            return std::nullopt;
        text = text.substr(1, 36);
    }
    if (text.size() != 36)
        return std::nullopt;
    std::uint8_t bytes[16] = {};
    int byte = 0;
    for (std::size_t i = 0; i < 36;) {
        if (i == 8 || i == 13 || i == 18 || i == 23) {
            if (text[i] != '-')
                return std::nullopt;
            ++i;
            continue;
        }
        const int hi = HexDigit(text[i]);
        const int lo = HexDigit(text[i + 1]);
        if (hi < 0 || lo < 0)
            return std::nullopt;
        bytes[byte++] = static_cast<std::uint8_t>(hi * 16 + lo);
        i += 2;
    }
    GUID g{};
    g.Data1 = (std::uint32_t{bytes[0]} << 24) | (std::uint32_t{bytes[1]} << 16) |
              (std::uint32_t{bytes[2]} << 8) | bytes[3];
    g.Data2 = static_cast<std::uint16_t>((bytes[4] << 8) | bytes[5]);
    g.Data3 = static_cast<std::uint16_t>((bytes[6] << 8) | bytes[7]);
    for (int i = 0; i < 8; ++i)
        g.Data4[i] = bytes[8 + i];
    return g;
}

} // namespace platform_detail

// Compile-time identifier: a malformed literal fails the build.
consteval GUID MakeGuid(std::string_view text) {
    const auto parsed = platform_detail::ParseGuid(text);
    if (!parsed)
        throw "malformed GUID literal";
    return *parsed;
}

constexpr GUID GUID_NULL{};

// Run-time parse of an identifier; nothing for malformed text.
std::optional<GUID> GuidFromString(std::string_view text);

// Registry form: braces and upper-case hexadecimal, "{D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1}".
std::string GuidToString(const GUID& guid);

// Writes the registry form with its terminating zero into buffer; returns the characters written
// including the zero, or 0 when the buffer holds fewer than 39 characters.
int StringFromGUID2(const GUID& guid, OLECHAR* buffer, int capacity);

struct GuidHash {
    std::size_t operator()(const GUID& g) const noexcept;
};

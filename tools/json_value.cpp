#include "tools/json_value.h"

#include <cstdint>
#include <limits>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

CComVariant IntegerVariant(std::int64_t value) {
    if (value >= std::numeric_limits<std::int32_t>::min() &&
        value <= std::numeric_limits<std::int32_t>::max())
        return CComVariant(static_cast<std::int32_t>(value));
    CComVariant variant;
    variant.vt = VT_I8;
    variant.llVal = value;
    return variant;
}

CComVariant UnsignedVariant(std::uint64_t value) {
    if (value <= static_cast<std::uint64_t>(std::numeric_limits<std::int64_t>::max()))
        return IntegerVariant(static_cast<std::int64_t>(value));
    CComVariant variant;
    variant.vt = VT_UI8;
    variant.ullVal = value;
    return variant;
}

CComVariant NullVariant() {
    CComVariant variant;
    variant.vt = VT_NULL;
    return variant;
}

} // namespace

std::optional<CComVariant> ScalarVariant(const Json& value) {
    switch (value.type()) {
    case Json::value_t::number_integer:
        return IntegerVariant(value.get<std::int64_t>());
    case Json::value_t::number_unsigned:
        return UnsignedVariant(value.get<std::uint64_t>());
    case Json::value_t::number_float:
        return CComVariant(value.get<double>());
    case Json::value_t::boolean:
        return CComVariant(value.get<bool>());
    case Json::value_t::string:
        return CComVariant(std::u16string_view(Utf8ToUtf16(value.get<std::string>())));
    case Json::value_t::null:
        return NullVariant();
    default:
        return std::nullopt;
    }
}

const char* ExpectedValue(VARTYPE vt) {
    switch (vt) {
    case VT_R4:
    case VT_R8:
        return "a number";
    case VT_I1:
    case VT_UI1:
    case VT_I2:
    case VT_UI2:
    case VT_I4:
    case VT_UI4:
    case VT_I8:
    case VT_UI8:
        return "an integer";
    case VT_BOOL:
        return "true or false";
    case VT_BSTR:
        return "a string";
    case VT_DISPATCH:
    case VT_UNKNOWN:
        return "an object, an array of its property values, or null";
    default:
        return "a number, a boolean or a string";
    }
}

} // namespace Norvane::Lumis::Scanning::Tool

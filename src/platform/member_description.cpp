#include "platform/member_description.h"

namespace dispatch_detail {

bool IsInteger(const VARIANT& v) {
    switch (v.vt) {
    case VT_I1:
    case VT_UI1:
    case VT_I2:
    case VT_UI2:
    case VT_I4:
    case VT_UI4:
    case VT_I8:
    case VT_UI8:
        return true;
    default:
        return false;
    }
}

bool IsFloating(const VARIANT& v) {
    return v.vt == VT_R4 || v.vt == VT_R8;
}

std::int64_t IntegerOf(const VARIANT& v) {
    switch (v.vt) {
    case VT_I1:
        return v.cVal;
    case VT_UI1:
        return v.bVal;
    case VT_I2:
        return v.iVal;
    case VT_UI2:
        return v.uiVal;
    case VT_I4:
        return v.lVal;
    case VT_UI4:
        return v.ulVal;
    case VT_I8:
        return v.llVal;
    default:
        return static_cast<std::int64_t>(v.ullVal);
    }
}

std::uint64_t UnsignedOf(const VARIANT& v) {
    return v.vt == VT_UI8 ? v.ullVal : static_cast<std::uint64_t>(IntegerOf(v));
}

double FloatingOf(const VARIANT& v) {
    return v.vt == VT_R4 ? static_cast<double>(v.fltVal) : v.dblVal;
}

bool IsNullObject(const VARIANT& v) {
    return v.vt == VT_EMPTY || v.vt == VT_NULL ||
           ((v.vt == VT_UNKNOWN || v.vt == VT_DISPATCH) && v.punkVal == nullptr);
}

IUnknown* ObjectOf(const VARIANT& v) {
    return v.vt == VT_DISPATCH ? static_cast<IUnknown*>(v.pdispVal) : v.punkVal;
}

HRESULT Argument<GUID>::Load(const VARIANT& v) {
    if (v.vt != VT_BSTR) return DISP_E_TYPEMISMATCH;
    const auto parsed = GuidFromString(Utf16ToUtf8(BstrView(v.bstrVal)));
    if (!parsed) return DISP_E_TYPEMISMATCH;
    value = *parsed;
    return S_OK;
}

void Result<GUID>::Store(VARIANT* out) {
    out->vt = VT_BSTR;
    out->bstrVal = CComBSTR(GuidToString(value)).Detach();
}

} // namespace dispatch_detail

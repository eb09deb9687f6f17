#include "platform/variant.h"

#include "platform/dispatch.h"

#include <cstring>
#include <new>
#include <utility>

void VariantInit(VARIANT* v) {
    std::memset(v, 0, sizeof *v);
}

HRESULT VariantClear(VARIANT* v) {
    if (v == nullptr)
        return E_POINTER;
    switch (v->vt) {
    case VT_BSTR:
        SysFreeString(v->bstrVal);
        break;
    case VT_UNKNOWN:
        if (v->punkVal)
            v->punkVal->Release();
        break;
    case VT_DISPATCH:
        if (v->pdispVal)
            v->pdispVal->Release();
        break;
    default:
        break;
    }
    VariantInit(v);
    return S_OK;
}

HRESULT VariantCopy(VARIANT* destination, const VARIANT* source) {
    if (destination == nullptr || source == nullptr)
        return E_POINTER;
    if (destination == source)
        return S_OK;
    VARIANT copy = *source;
    if (source->vt == VT_BSTR && source->bstrVal != nullptr) {
        copy.bstrVal = SysAllocStringLen(source->bstrVal, SysStringLen(source->bstrVal));
        if (copy.bstrVal == nullptr)
            return E_OUTOFMEMORY;
    } else if (source->vt == VT_UNKNOWN && source->punkVal) {
        source->punkVal->AddRef();
    } else if (source->vt == VT_DISPATCH && source->pdispVal) {
        source->pdispVal->AddRef();
    }
    VariantClear(destination);
    *destination = copy;
    return S_OK;
}

CComVariant::CComVariant(const CComVariant& other) : CComVariant(static_cast<const VARIANT&>(other)) {}

CComVariant::CComVariant(CComVariant&& other) noexcept : VARIANT(other) {
    VariantInit(&other);
}

CComVariant::CComVariant(const VARIANT& other) {
    VariantInit(this);
    if (FAILED(VariantCopy(this, &other)))
        throw std::bad_alloc();
}

CComVariant::CComVariant(double value) {
    VariantInit(this);
    vt = VT_R8;
    dblVal = value;
}

CComVariant::CComVariant(std::int32_t value) {
    VariantInit(this);
    vt = VT_I4;
    lVal = value;
}

CComVariant::CComVariant(bool value) {
    VariantInit(this);
    vt = VT_BOOL;
    boolVal = ToVariantBool(value);
}

CComVariant::CComVariant(std::u16string_view text) {
    VariantInit(this);
    vt = VT_BSTR;
    bstrVal = CComBSTR(text).Detach();
}

CComVariant::CComVariant(const OLECHAR* text) {
    VariantInit(this);
    vt = VT_BSTR;
    if (text != nullptr)
        bstrVal = CComBSTR(std::u16string_view(text)).Detach();
}

CComVariant::CComVariant(IUnknown* object) {
    VariantInit(this);
    vt = VT_UNKNOWN;
    punkVal = object;
    if (object)
        object->AddRef();
}

CComVariant::CComVariant(IDispatch* object) {
    VariantInit(this);
    vt = VT_DISPATCH;
    pdispVal = object;
    if (object)
        object->AddRef();
}

CComVariant& CComVariant::operator=(CComVariant other) noexcept {
    std::swap(static_cast<VARIANT&>(*this), static_cast<VARIANT&>(other));
    return *this;
}

void CComVariant::Detach(VARIANT* destination) {
    *destination = *this;
    VariantInit(this);
}

// Self-describing values for automation calls.
#pragma once

#include "platform/bstr.h"
#include "platform/unknown.h"

struct IDispatch;

using VARTYPE = std::uint16_t;

enum VARENUM : VARTYPE {
    VT_EMPTY = 0,
    VT_NULL = 1,
    VT_I2 = 2,
    VT_I4 = 3,
    VT_R4 = 4,
    VT_R8 = 5,
    VT_BSTR = 8,
    VT_DISPATCH = 9,
    VT_ERROR = 10,
    VT_BOOL = 11,
    VT_VARIANT = 12,
    VT_UNKNOWN = 13,
    VT_I1 = 16,
    VT_UI1 = 17,
    VT_UI2 = 18,
    VT_UI4 = 19,
    VT_I8 = 20,
    VT_UI8 = 21,
};

struct VARIANT {
    VARTYPE vt;
    WORD wReserved1;
    WORD wReserved2;
    WORD wReserved3;
    union {
        std::int8_t cVal;
        std::uint8_t bVal;
        std::int16_t iVal;
        std::uint16_t uiVal;
        std::int32_t lVal;
        std::uint32_t ulVal;
        std::int64_t llVal;
        std::uint64_t ullVal;
        float fltVal;
        double dblVal;
        VARIANT_BOOL boolVal;
        SCODE scode;
        BSTR bstrVal;
        IUnknown* punkVal;
        IDispatch* pdispVal;
    };
};

void VariantInit(VARIANT* v);
// Releases what the variant owns (string, interface) and leaves it empty.
HRESULT VariantClear(VARIANT* v);
// Deep copy: strings are duplicated, interfaces referenced once more.
HRESULT VariantCopy(VARIANT* destination, const VARIANT* source);

// Owning wrapper.
class CComVariant : public VARIANT {
  public:
    CComVariant() { VariantInit(this); }
    CComVariant(const CComVariant& other);
    CComVariant(CComVariant&& other) noexcept;
    explicit CComVariant(const VARIANT& other);
    CComVariant(double value);
    CComVariant(std::int32_t value);
    CComVariant(bool value);
    CComVariant(std::u16string_view text);
    // A string literal or BSTR is a string (a null one the empty string), never a boolean.
    CComVariant(const OLECHAR* text);
    CComVariant(const char* text) = delete;
    CComVariant(IUnknown* object);
    CComVariant(IDispatch* object);
    ~CComVariant() { VariantClear(this); }
    CComVariant& operator=(CComVariant other) noexcept;

    void Clear() { VariantClear(this); }
    // Gives up ownership to a raw variant the caller then owns.
    void Detach(VARIANT* destination);
};

// Automation by name: IDispatch, its call records, and the type information behind it.
#pragma once

#include "platform/variant.h"

#include <span>

struct InterfaceDescription;

struct DISPPARAMS {
    VARIANT* rgvarg; // arguments in reverse order: the last argument first
    DISPID* rgdispidNamedArgs;
    UINT cArgs;
    UINT cNamedArgs;
};

struct EXCEPINFO {
    WORD wCode;
    WORD wReserved;
    BSTR bstrSource;
    BSTR bstrDescription;
    BSTR bstrHelpFile;
    DWORD dwHelpContext;
    void* pvReserved;
    void* pfnDeferredFillIn;
    SCODE scode;
};

constexpr WORD DISPATCH_METHOD = 0x1;
constexpr WORD DISPATCH_PROPERTYGET = 0x2;
constexpr WORD DISPATCH_PROPERTYPUT = 0x4;
constexpr WORD DISPATCH_PROPERTYPUTREF = 0x8;
constexpr DISPID DISPID_UNKNOWN = -1;
constexpr DISPID DISPID_PROPERTYPUT = -3;

// Type information of one interface: the description of every member, readable by programs.
struct ITypeInfo : IUnknown {
    using BaseInterface = IUnknown;
    static constexpr IID iid = MakeGuid("00020401-0000-0000-C000-000000000046");

    virtual HRESULT GetInterfaceDescription(const InterfaceDescription** out) = 0;

  protected:
    ~ITypeInfo() = default;
};

struct IDispatch : IUnknown {
    using BaseInterface = IUnknown;
    static constexpr IID iid = MakeGuid("00020400-0000-0000-C000-000000000046");

    virtual HRESULT GetTypeInfoCount(UINT* count) = 0;
    virtual HRESULT GetTypeInfo(UINT index, LCID locale, ITypeInfo** out) = 0;
    virtual HRESULT GetIDsOfNames(REFIID reserved, LPOLESTR* names, UINT count, LCID locale, DISPID* ids) = 0;
    virtual HRESULT Invoke(DISPID member, REFIID reserved, LCID locale, WORD flags, DISPPARAMS* params,
                           VARIANT* result, EXCEPINFO* exception, UINT* argumentError) = 0;

  protected:
    ~IDispatch() = default;
};

// Releases the strings of an exception record.
void ClearExcepInfo(EXCEPINFO* info);

// Per-thread error information: the description a failed method leaves for its caller.
//
// Each thread has one slot. SetErrorInfo fills it (null empties it); GetErrorInfo hands its content
// over and empties it, returning S_FALSE when there was nothing.
#pragma once

#include "platform/bstr.h"
#include "platform/com_ptr.h"

#include <array>

struct IErrorInfo : IUnknown {
    using BaseInterface = IUnknown;
    static constexpr IID iid = MakeGuid("1CF2B120-547D-101B-8E65-08002B2BD119");

    virtual HRESULT GetGUID(GUID* guid) = 0;
    virtual HRESULT GetSource(BSTR* source) = 0;
    virtual HRESULT GetDescription(BSTR* description) = 0;
    virtual HRESULT GetHelpFile(BSTR* helpFile) = 0;
    virtual HRESULT GetHelpContext(DWORD* helpContext) = 0;

  protected:
    ~IErrorInfo() = default;
};

struct ICreateErrorInfo : IUnknown {
    using BaseInterface = IUnknown;
    static constexpr IID iid = MakeGuid("22F03340-547D-101B-8E65-08002B2BD119");

    virtual HRESULT SetGUID(REFIID guid) = 0;
    virtual HRESULT SetSource(LPCOLESTR source) = 0;
    virtual HRESULT SetDescription(LPCOLESTR description) = 0;
    virtual HRESULT SetHelpFile(LPCOLESTR helpFile) = 0;
    virtual HRESULT SetHelpContext(DWORD helpContext) = 0;

  protected:
    ~ICreateErrorInfo() = default;
};

struct ISupportErrorInfo : IUnknown {
    using BaseInterface = IUnknown;
    static constexpr IID iid = MakeGuid("DF0B3D60-548F-101B-8E65-08002B2BD119");

    virtual HRESULT InterfaceSupportsErrorInfo(REFIID riid) = 0;

  protected:
    ~ISupportErrorInfo() = default;
};

HRESULT CreateErrorInfo(ICreateErrorInfo** out);
HRESULT SetErrorInfo(DWORD reserved, IErrorInfo* info);
HRESULT GetErrorInfo(DWORD reserved, IErrorInfo** out);

// Answers S_OK for the listed interfaces (up to nine) and S_FALSE for every other.
template <class... Is> class ISupportErrorInfoImplEx : public ISupportErrorInfo {
    static_assert(sizeof...(Is) >= 1 && sizeof...(Is) <= 9, "one to nine interfaces");

  public:
    HRESULT InterfaceSupportsErrorInfo(REFIID riid) override {
        return ((riid == Is::iid) || ...) ? S_OK : S_FALSE;
    }
};

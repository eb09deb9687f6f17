#include "platform/error_info.h"

#include "platform/object.h"

namespace {

// The error-information object: written once through ICreateErrorInfo, read through IErrorInfo.
class CErrorInfo : public CComObjectRootBase, public IErrorInfo, public ICreateErrorInfo {
  public:
    using Interfaces = InterfaceMap<IErrorInfo, ICreateErrorInfo>;

    HRESULT GetGUID(GUID* guid) override {
        if (guid == nullptr)
            return E_POINTER;
        *guid = guid_;
        return S_OK;
    }
    HRESULT GetSource(BSTR* out) override { return CopyOut(source_, out); }
    HRESULT GetDescription(BSTR* out) override { return CopyOut(description_, out); }
    HRESULT GetHelpFile(BSTR* out) override { return CopyOut(helpFile_, out); }
    HRESULT GetHelpContext(DWORD* out) override {
        if (out == nullptr)
            return E_POINTER;
        *out = helpContext_;
        return S_OK;
    }

    HRESULT SetGUID(REFIID guid) override {
        guid_ = guid;
        return S_OK;
    }
    HRESULT SetSource(LPCOLESTR text) override { return CopyIn(text, source_); }
    HRESULT SetDescription(LPCOLESTR text) override { return CopyIn(text, description_); }
    HRESULT SetHelpFile(LPCOLESTR text) override { return CopyIn(text, helpFile_); }
    HRESULT SetHelpContext(DWORD context) override {
        helpContext_ = context;
        return S_OK;
    }

  private:
    static HRESULT CopyOut(const std::u16string& text, BSTR* out) {
        if (out == nullptr)
            return E_POINTER;
        *out = SysAllocStringLen(text.data(), static_cast<UINT>(text.size()));
        return *out ? S_OK : E_OUTOFMEMORY;
    }
    static HRESULT CopyIn(LPCOLESTR text, std::u16string& field) {
        try {
            field = text ? std::u16string(text) : std::u16string();
            return S_OK;
        } catch (const std::bad_alloc&) {
            return E_OUTOFMEMORY;
        }
    }

    GUID guid_{};
    std::u16string source_;
    std::u16string description_;
    std::u16string helpFile_;
    DWORD helpContext_ = 0;
};

thread_local CComPtr<IErrorInfo> t_errorInfo;

} // namespace

HRESULT CreateErrorInfo(ICreateErrorInfo** out) {
    if (out == nullptr)
        return E_POINTER;
    *out = nullptr;
    auto* info = new (std::nothrow) CComObjectNoLock<CErrorInfo>();
    if (info == nullptr)
        return E_OUTOFMEMORY;
    info->AddRef();
    const HRESULT hr = info->QueryInterface(ICreateErrorInfo::iid, reinterpret_cast<void**>(out));
    info->Release();
    return hr;
}

HRESULT SetErrorInfo(DWORD, IErrorInfo* info) {
    t_errorInfo = info;
    return S_OK;
}

HRESULT GetErrorInfo(DWORD, IErrorInfo** out) {
    if (out == nullptr)
        return E_POINTER;
    *out = t_errorInfo.Detach();
    return *out ? S_OK : S_FALSE;
}

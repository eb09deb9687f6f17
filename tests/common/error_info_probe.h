// Test helpers: throwing a value through the boundary routine and reading what it published.
#pragma once

#include "module/error_reporting.h"
#include "platform/error_info.h"

#include <optional>
#include <string>

namespace Norvane::testing {

struct PublishedErrorInfo {
    GUID guid{};
    std::u16string source;
    std::u16string description;
    std::u16string helpFile;
    DWORD helpContext = 0;
};

// Takes the thread's error information out of its slot; nothing when the thread has none.
inline std::optional<PublishedErrorInfo> TakePublishedErrorInfo() {
    CComPtr<IErrorInfo> info;
    if (GetErrorInfo(0, &info) != S_OK)
        return std::nullopt;
    PublishedErrorInfo published;
    CComBSTR source, description, helpFile;
    info->GetGUID(&published.guid);
    info->GetSource(&source);
    info->GetDescription(&description);
    info->GetHelpFile(&helpFile);
    info->GetHelpContext(&published.helpContext);
    published.source = source.View();
    published.description = description.View();
    published.helpFile = helpFile.View();
    return published;
}

// Puts error information with the given description into the thread's slot, as a callee would.
inline void SetThreadErrorDescription(const std::u16string& description) {
    CComPtr<ICreateErrorInfo> creator;
    CreateErrorInfo(&creator);
    creator->SetDescription(description.c_str());
    SetErrorInfo(0, QueryAs<IErrorInfo>(creator.Get()));
}

template <class T> HRESULT ThrowAndTranslate(const T& value, REFIID riid) {
    try {
        throw value;
    } catch (...) {
        return TranslateCurrentException(riid);
    }
}

} // namespace Norvane::testing

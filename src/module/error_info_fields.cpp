#include "module/error_info_fields.h"

namespace Norvane {

namespace {

using TextGetter = HRESULT (IErrorInfo::*)(BSTR*);

std::u16string ReadText(IErrorInfo* info, TextGetter getter) {
    CComBSTR text;
    if (FAILED((info->*getter)(&text)))
        return {};
    return std::u16string(text.View());
}

DWORD ReadHelpContext(IErrorInfo* info) {
    DWORD context = 0;
    return SUCCEEDED(info->GetHelpContext(&context)) ? context : 0;
}

} // namespace

ErrorInfoFields ReadErrorInfoFields(IErrorInfo* info) {
    if (info == nullptr)
        return {};
    return ErrorInfoFields{ReadText(info, &IErrorInfo::GetSource),
                           ReadText(info, &IErrorInfo::GetDescription),
                           ReadText(info, &IErrorInfo::GetHelpFile), ReadHelpContext(info)};
}

ErrorInfoFields TakeThreadErrorInfoFields() {
    CComPtr<IErrorInfo> info;
    if (GetErrorInfo(0, &info) != S_OK)
        return {};
    return ReadErrorInfoFields(info);
}

} // namespace Norvane

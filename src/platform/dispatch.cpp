#include "platform/dispatch_impl.h"

#include <string>
#include <vector>

void ClearExcepInfo(EXCEPINFO* info) {
    if (info == nullptr)
        return;
    SysFreeString(info->bstrSource);
    SysFreeString(info->bstrDescription);
    SysFreeString(info->bstrHelpFile);
    *info = EXCEPINFO{};
}

namespace dispatch_detail {

namespace {

// Moves the thread's error information into the caller's exception record.
void FillException(EXCEPINFO* exception, HRESULT hr) {
    *exception = EXCEPINFO{};
    exception->scode = hr;
    CComPtr<IErrorInfo> info;
    if (GetErrorInfo(0, &info) != S_OK)
        return;
    info->GetSource(&exception->bstrSource);
    info->GetDescription(&exception->bstrDescription);
    info->GetHelpFile(&exception->bstrHelpFile);
    info->GetHelpContext(&exception->dwHelpContext);
}

} // namespace

HRESULT InvokeMember(void* self, const MemberDescription& member, DISPPARAMS* params, VARIANT* result,
                     EXCEPINFO* exception, UINT* argumentError) {
    const UINT given = params ? params->cArgs : 0;
    if (given != member.params.size())
        return DISP_E_BADPARAMCOUNT;
    if (params && params->cNamedArgs > 0 &&
        !(member.kind == MemberKind::PropertyPut && params->cNamedArgs == 1 &&
          params->rgdispidNamedArgs[0] == DISPID_PROPERTYPUT))
        return DISP_E_PARAMNOTFOUND;
    // The record holds the arguments last first; the table takes them in declaration order.
    std::vector<VARIANT> args(given);
    for (UINT i = 0; i < given; ++i)
        args[i] = params->rgvarg[given - 1 - i];
    if (result)
        VariantInit(result);
    const InvokeOutcome outcome = member.invoke(self, args.data(), result);
    if (!outcome.called) {
        if (argumentError)
            *argumentError = given - 1 - outcome.badArgument;
        return outcome.hr;
    }
    if (FAILED(outcome.hr) && exception != nullptr) {
        FillException(exception, outcome.hr);
        return DISP_E_EXCEPTION;
    }
    return outcome.hr;
}

HRESULT LookUpNames(const std::vector<DispatchMember>& members, LPOLESTR* names, UINT count, DISPID* ids) {
    if (names == nullptr || ids == nullptr || count == 0)
        return E_POINTER;
    const std::string name = Utf16ToUtf8(names[0] ? std::u16string_view(names[0]) : std::u16string_view());
    const DispatchMember* member = FindMember(members, std::string_view(name));
    ids[0] = member ? member->id : DISPID_UNKNOWN;
    // Named arguments are not supported: every further name is unknown.
    for (UINT i = 1; i < count; ++i)
        ids[i] = DISPID_UNKNOWN;
    return member && count == 1 ? S_OK : DISP_E_UNKNOWNNAME;
}

} // namespace dispatch_detail

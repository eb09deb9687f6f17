#include "tools/library_call.h"

#include "platform/error_info.h"
#include "tools/tool_error.h"

namespace Norvane::Lumis::Scanning::Tool {

std::string TakeErrorText() {
    CComPtr<IErrorInfo> info;
    if (GetErrorInfo(0, &info) != S_OK || !info)
        return {};
    CComBSTR description;
    if (FAILED(info->GetDescription(&description)))
        return {};
    return description.Utf8();
}

HRESULT CheckCall(HRESULT hr, std::string_view step) {
    if (FAILED(hr))
        throw ToolError(std::string(step) + ": " + DescribeFailure(TakeErrorText(), hr, "call failed"));
    return hr;
}

} // namespace Norvane::Lumis::Scanning::Tool

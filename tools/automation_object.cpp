#include "tools/automation_object.h"

#include "tools/tool_error.h"

namespace Norvane::Lumis::Scanning::Tool {

namespace {

const InterfaceDescription& DescriptionOf(IDispatch* dispatch, const std::string& path) {
    CComPtr<ITypeInfo> typeInfo;
    const InterfaceDescription* description = nullptr;
    if (FAILED(dispatch->GetTypeInfo(0, 0, &typeInfo)) || !typeInfo ||
        FAILED(typeInfo->GetInterfaceDescription(&description)) || description == nullptr)
        throw ToolError(path + ": the object does not describe its automation interface");
    return *description;
}

} // namespace

AutomationObject::AutomationObject(IUnknown* object, const std::string& path)
    : dispatch_(QueryAs<IDispatch>(object)) {
    if (!dispatch_)
        throw ToolError(path + ": the object has no automation interface");
    const InterfaceDescription& description = DescriptionOf(dispatch_, path);
    interfaceName_ = description.name;
    members_ = FlattenMembers(description);
}

const DispatchMember* AutomationObject::Find(std::string_view name) const {
    return FindMember(members_, name);
}

std::vector<const DispatchMember*> AutomationObject::SettableProperties() const {
    std::vector<const DispatchMember*> properties;
    for (const DispatchMember& member : members_)
        if (member.put != nullptr)
            properties.push_back(&member);
    return properties;
}

CallOutcome AutomationObject::Put(const DispatchMember& member, const VARIANT& value) const {
    VARIANT argument = value;
    DISPID named = DISPID_PROPERTYPUT;
    DISPPARAMS params{&argument, &named, 1, 1};
    return Invoke(member, DISPATCH_PROPERTYPUT, &params, nullptr);
}

CallOutcome AutomationObject::Get(const DispatchMember& member, VARIANT* result) const {
    DISPPARAMS params{nullptr, nullptr, 0, 0};
    return Invoke(member, DISPATCH_PROPERTYGET, &params, result);
}

CallOutcome AutomationObject::Call(const DispatchMember& member, const VARIANT& argument) const {
    VARIANT copy = argument;
    DISPPARAMS params{&copy, nullptr, 1, 0};
    return Invoke(member, DISPATCH_METHOD, &params, nullptr);
}

CallOutcome AutomationObject::Invoke(const DispatchMember& member, WORD flags, DISPPARAMS* params,
                                     VARIANT* result) const {
    constexpr IID reserved{};
    EXCEPINFO exception{};
    UINT argumentError = 0;
    const HRESULT hr =
        dispatch_->Invoke(member.id, reserved, 0, flags, params, result, &exception, &argumentError);
    if (hr != DISP_E_EXCEPTION)
        return {hr, {}, false};
    CallOutcome outcome{exception.scode, CComBSTR::Copy(exception.bstrDescription).Utf8(), true};
    ClearExcepInfo(&exception);
    return outcome;
}

} // namespace Norvane::Lumis::Scanning::Tool

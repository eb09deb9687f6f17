#include "tools/automation_object.h"

#include "platform/dispatch_impl.h"

#include <algorithm>
#include "tools/tool_error.h"

#include <beamweaver/pattern.h>

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

// Interfaces of the library that are not automation interfaces but carry members a job may use.
struct PlainInterface {
    const IID* iid;
    const InterfaceDescription& (*describe)();
};

const PlainInterface kPlainInterfaces[] = {
    {&IExclusionAwarePattern::iid, &IExclusionAwarePattern::Description<>},
    {&IExcludablePatternShape::iid, &IExcludablePatternShape::Description<>},
    {&ICloneablePattern::iid, &ICloneablePattern::Description<>},
};

} // namespace

AutomationObject::AutomationObject(IUnknown* object, const std::string& path)
    : dispatch_(QueryAs<IDispatch>(object)) {
    if (!dispatch_)
        throw ToolError(path + ": the object has no automation interface");
    const InterfaceDescription& description = DescriptionOf(dispatch_, path);
    interfaceName_ = description.name;
    members_ = FlattenMembers(description);
    AddPlainInterfaces(object);
}

void AutomationObject::AddPlainInterfaces(IUnknown* object) {
    for (const PlainInterface& plain : kPlainInterfaces) {
        CComPtr<IUnknown> target;
        if (FAILED(object->QueryInterface(*plain.iid, reinterpret_cast<void**>(&target))))
            continue;
        for (DispatchMember member : FlattenMembers(plain.describe())) {
            member.id = static_cast<DISPID>(members_.size() + 1);
            members_.push_back(member);
            plainTargets_.emplace_back(member.id, target);
        }
    }
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
    HRESULT hr = S_OK;
    const auto plain = std::find_if(plainTargets_.begin(), plainTargets_.end(),
                                    [&](const auto& entry) { return entry.first == member.id; });
    if (plain == plainTargets_.end()) {
        hr = dispatch_->Invoke(member.id, reserved, 0, flags, params, result, &exception, &argumentError);
    } else {
        const MemberDescription* form = SelectForm(member, flags);
        hr = form ? dispatch_detail::InvokeMember(plain->second.Get(), *form, params, result, &exception,
                                                  &argumentError)
                  : DISP_E_MEMBERNOTFOUND;
    }
    if (hr != DISP_E_EXCEPTION)
        return {hr, {}, false};
    CallOutcome outcome{exception.scode, CComBSTR::Copy(exception.bstrDescription).Utf8(), true};
    ClearExcepInfo(&exception);
    return outcome;
}

} // namespace Norvane::Lumis::Scanning::Tool

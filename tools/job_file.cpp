#include "tools/job_file.h"

#include "platform/class_factory.h"
#include "tools/automation_object.h"
#include "tools/json_value.h"
#include "tools/library_call.h"
#include "tools/tool_error.h"

#include <string_view>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

std::string Child(const std::string& path, std::string_view key) {
    return path.empty() ? std::string(key) : path + "." + std::string(key);
}

std::string Element(const std::string& path, std::size_t index) {
    return path + "[" + std::to_string(index) + "]";
}

[[noreturn]] void Fail(const std::string& path, const std::string& reason) {
    throw ToolError(path + ": " + reason);
}

bool IsObjectType(const ParamType& type) {
    return type.vt == VT_DISPATCH || type.vt == VT_UNKNOWN;
}

std::string WrongType(const ParamType& type) {
    return std::string("value of the wrong type, expected ") + ExpectedValue(type.vt);
}

std::string ReasonFor(const CallOutcome& outcome, const ParamType& type) {
    if (outcome.libraryError)
        return DescribeFailure(outcome.text, outcome.hr, "value refused");
    switch (outcome.hr) {
    case DISP_E_TYPEMISMATCH:
        return DescribeFailure(WrongType(type), outcome.hr, "");
    case DISP_E_OVERFLOW:
        return DescribeFailure("value out of range", outcome.hr, "");
    default:
        return DescribeFailure("call failed", outcome.hr, "");
    }
}

// Where an object-valued member gets its current value from: the owner's getter of the member, if any.
struct CurrentValue {
    const AutomationObject* owner = nullptr;
    const DispatchMember* member = nullptr;
};

const ClassEntry& ResolveClass(const Json& name, const std::string& path) {
    if (!name.is_string())
        Fail(path, "expected a class name or ProgID string");
    const ClassEntry* entry = FindClassByName(name.get<std::string>());
    if (entry == nullptr)
        Fail(path, "unknown class \"" + name.get<std::string>() + "\"");
    return *entry;
}

CComPtr<IUnknown> CreateObject(const ClassEntry& entry, const std::string& path) {
    CComPtr<IUnknown> object;
    const HRESULT hr =
        CoCreateInstance(entry.clsid, nullptr, CLSCTX_ALL, IUnknown::iid, reinterpret_cast<void**>(&object));
    if (FAILED(hr))
        Fail(path,
             "cannot create " + entry.name + ": " + DescribeFailure(TakeErrorText(), hr, "creation failed"));
    return object;
}

CComPtr<IUnknown> CreateNamedObject(const ParamType& type, const Json& name, const std::string& path) {
    const ClassEntry& entry = ResolveClass(name, Child(path, "class"));
    CComPtr<IUnknown> object = CreateObject(entry, Child(path, "class"));
    CComPtr<IUnknown> typed;
    if (FAILED(object->QueryInterface(*type.iid, reinterpret_cast<void**>(&typed))))
        Fail(Child(path, "class"), entry.name + " is not of the type this member takes");
    return object;
}

CComPtr<IUnknown> CreateDefaultObject(const ParamType& type, const std::string& path) {
    const ClassEntry* entry = FindDefaultClass(*type.iid);
    if (entry == nullptr)
        Fail(path, "no \"class\" given, and the member's type has no default class to create");
    return CreateObject(*entry, path);
}

CComPtr<IUnknown> ObjectIn(const VARIANT& value) {
    if (value.vt == VT_DISPATCH)
        return static_cast<IUnknown*>(value.pdispVal);
    if (value.vt == VT_UNKNOWN)
        return value.punkVal;
    return nullptr;
}

// The member's current value when it has a getter and holds an object, else a new default object.
CComPtr<IUnknown> CurrentOrDefaultObject(const ParamType& type, const CurrentValue& current,
                                         const std::string& path) {
    if (current.member != nullptr && current.member->get != nullptr) {
        CComVariant value;
        const CallOutcome outcome = current.owner->Get(*current.member, &value);
        if (!outcome.Succeeded())
            Fail(path, "reading the current value failed: " +
                           DescribeFailure(outcome.text, outcome.hr, "call failed"));
        if (CComPtr<IUnknown> object = ObjectIn(value))
            return object;
    }
    return CreateDefaultObject(type, path);
}

CComVariant ObjectVariant(const ParamType& type, IUnknown* object) {
    if (type.vt == VT_DISPATCH)
        return CComVariant(QueryAs<IDispatch>(object).Get());
    return CComVariant(object);
}

void ApplyKeys(const AutomationObject& target, const Json& job, const std::string& path);
void ApplyPositional(IUnknown* object, const Json& values, const std::string& path);

CComVariant ValueFor(const ParamType& type, const Json& value, const std::string& path,
                     const CurrentValue& current) {
    if (!IsObjectType(type)) {
        std::optional<CComVariant> scalar = ScalarVariant(value);
        if (!scalar)
            Fail(path, WrongType(type));
        return *scalar;
    }
    if (value.is_null())
        return ObjectVariant(type, nullptr);
    if (value.is_array()) {
        CComPtr<IUnknown> object = CurrentOrDefaultObject(type, current, path);
        ApplyPositional(object, value, path);
        return ObjectVariant(type, object);
    }
    if (value.is_object()) {
        const auto name = value.find("class");
        CComPtr<IUnknown> object = name != value.end() ? CreateNamedObject(type, *name, path)
                                                       : CurrentOrDefaultObject(type, current, path);
        ApplyKeys(AutomationObject(object, path), value, path);
        return ObjectVariant(type, object);
    }
    Fail(path, WrongType(type));
}

void SetProperty(const AutomationObject& target, const DispatchMember& member, const Json& value,
                 const std::string& path) {
    if (member.put->params.size() != 1)
        Fail(path, "a property with arguments cannot be set from a job");
    const ParamType type = member.put->params[0];
    const CComVariant argument = ValueFor(type, value, path, CurrentValue{&target, &member});
    const CallOutcome outcome = target.Put(member, argument);
    if (!outcome.Succeeded())
        Fail(path, ReasonFor(outcome, type));
}

void CallOncePerElement(const AutomationObject& target, const DispatchMember& member, const Json& value,
                        const std::string& path) {
    const MemberDescription& method = *member.method;
    if (method.params.size() != 1)
        Fail(path, "the method takes " + std::to_string(method.params.size()) +
                       " arguments; a job calls only methods that take one");
    if (!value.is_array())
        Fail(path, "expected an array with one argument per call");
    const ParamType type = method.params[0];
    for (std::size_t i = 0; i < value.size(); ++i) {
        const CComVariant argument = ValueFor(type, value[i], Element(path, i), CurrentValue{});
        const CallOutcome outcome = target.Call(member, argument);
        if (!outcome.Succeeded())
            Fail(Element(path, i), ReasonFor(outcome, type));
    }
}

void ApplyKey(const AutomationObject& target, std::string_view key, const Json& value,
              const std::string& path) {
    const DispatchMember* member = target.Find(key);
    if (member == nullptr)
        Fail(path, std::string("unknown property or method of ") + target.InterfaceName());
    if (member->put != nullptr)
        SetProperty(target, *member, value, path);
    else if (member->method != nullptr)
        CallOncePerElement(target, *member, value, path);
    else
        Fail(path, std::string("read-only property of ") + target.InterfaceName());
}

void ApplyKeys(const AutomationObject& target, const Json& job, const std::string& path) {
    for (const auto& [key, value] : job.items())
        if (key != "class")
            ApplyKey(target, key, value, Child(path, key));
}

std::string NamesOf(const std::vector<const DispatchMember*>& properties) {
    std::string names;
    for (const DispatchMember* property : properties)
        names += (names.empty() ? "" : ", ") + std::string(property->name);
    return names;
}

void ApplyPositional(IUnknown* object, const Json& values, const std::string& path) {
    const AutomationObject target(object, path);
    const std::vector<const DispatchMember*> properties = target.SettableProperties();
    if (values.size() != properties.size())
        Fail(path, "expected " + std::to_string(properties.size()) + " values (" + NamesOf(properties) +
                       "), got " + std::to_string(values.size()));
    for (std::size_t i = 0; i < values.size(); ++i)
        SetProperty(target, *properties[i], values[i], Element(path, i));
}

} // namespace

JobObject ApplyJob(const Json& job) {
    if (!job.is_object())
        Fail("job", "a job is one JSON object with a \"class\" key");
    const auto name = job.find("class");
    if (name == job.end())
        Fail("class", "missing: a job names the class of the object to create");
    const ClassEntry& entry = ResolveClass(*name, "class");
    const AutomationObject target(CreateObject(entry, "class"), "class");
    ApplyKeys(target, job, "");
    return {target.Dispatch(), entry.name};
}

} // namespace Norvane::Lumis::Scanning::Tool

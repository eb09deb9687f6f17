// One object as a job file sees it: its automation interface and the members of that interface's chain,
// called by name, plus the members of the library's plain (non-automation) pattern interfaces that the
// object answers — exclusion, exclusion shape, cloning — called through their member tables.
#pragma once

#include "platform/dispatch_members.h"

#include <string>
#include <utility>
#include <string_view>
#include <vector>

namespace Norvane::Lumis::Scanning::Tool {

// How a call ended. For a failure the library reported itself (DISP_E_EXCEPTION) hr is the library's
// HRESULT and text its error text; for a failure of the automation layer (a wrong type, an overflow)
// hr is that layer's code and text is empty.
struct CallOutcome {
    HRESULT hr;
    std::string text;
    bool libraryError;

    bool Succeeded() const { return SUCCEEDED(hr); }
};

class AutomationObject {
  public:
    // The object's own automation interface: the one it answers for IDispatch. Throws ToolError naming
    // path when the object has none or does not describe it.
    AutomationObject(IUnknown* object, const std::string& path);

    IDispatch* Dispatch() const { return dispatch_; }
    const char* InterfaceName() const { return interfaceName_; }

    // Case-insensitive, as automation names are; null when there is no such member.
    const DispatchMember* Find(std::string_view name) const;
    // The properties that can be put, in the interface chain's order (root interface first).
    std::vector<const DispatchMember*> SettableProperties() const;

    CallOutcome Put(const DispatchMember& member, const VARIANT& value) const;
    CallOutcome Get(const DispatchMember& member, VARIANT* result) const;
    CallOutcome Call(const DispatchMember& member, const VARIANT& argument) const;

  private:
    CallOutcome Invoke(const DispatchMember& member, WORD flags, DISPPARAMS* params, VARIANT* result) const;

    void AddPlainInterfaces(IUnknown* object);

    CComPtr<IDispatch> dispatch_;
    const char* interfaceName_ = "";
    std::vector<DispatchMember> members_;
    // For members of plain interfaces: the interface pointer to call them on, by dispatch identifier.
    std::vector<std::pair<DISPID, CComPtr<IUnknown>>> plainTargets_;
};

} // namespace Norvane::Lumis::Scanning::Tool

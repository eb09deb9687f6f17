// Calls members of an object by name through IDispatch, as an automation client does.
#pragma once

#include "platform/dispatch.h"

#include <string>
#include <utility>
#include <vector>

namespace platform_test {

class AutomationClient {
  public:
    explicit AutomationClient(IDispatch* target) : target_(target) {}

    // The member's dispatch identifier; DISPID_UNKNOWN for a name the object does not know.
    DISPID IdOf(std::u16string name) const {
        LPOLESTR names[] = {name.data()};
        DISPID id = DISPID_UNKNOWN;
        target_->GetIDsOfNames(GUID_NULL, names, 1, 0, &id);
        return id;
    }

    // Arguments in declaration order; the call record receives them last first, as automation passes them.
    HRESULT Call(std::u16string name, WORD flags, const std::vector<CComVariant>& args,
                 VARIANT* result = nullptr, EXCEPINFO* exception = nullptr,
                 UINT* argumentError = nullptr) const {
        const DISPID id = IdOf(std::move(name));
        if (id == DISPID_UNKNOWN)
            return DISP_E_UNKNOWNNAME;
        std::vector<VARIANT> reversed(args.rbegin(), args.rend());
        DISPID putId = DISPID_PROPERTYPUT;
        const bool put = (flags & DISPATCH_PROPERTYPUT) != 0;
        DISPPARAMS params{reversed.data(), put ? &putId : nullptr, static_cast<UINT>(reversed.size()),
                          put ? 1u : 0u};
        return target_->Invoke(id, GUID_NULL, 0, flags, &params, result, exception, argumentError);
    }

    HRESULT Put(std::u16string name, const CComVariant& value, UINT* argumentError = nullptr) const {
        return Call(std::move(name), DISPATCH_PROPERTYPUT, {value}, nullptr, nullptr, argumentError);
    }

    HRESULT Get(std::u16string name, CComVariant& result) const {
        result.Clear();
        return Call(std::move(name), DISPATCH_PROPERTYGET, {}, &result);
    }

  private:
    IDispatch* target_;
};

} // namespace platform_test

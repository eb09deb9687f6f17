// IDispatch for a dual interface, served from the interface's member table.
#pragma once

#include "platform/dispatch_members.h"
#include "platform/error_info.h"

#include <vector>

namespace dispatch_detail {

// The pointer through which a member declared by owner is called, for an object seen as I.
template <class I> void* PointerFor(I* object, const InterfaceDescription* owner) {
    if (owner == &I::Description())
        return object;
    if constexpr (requires { I::BaseInterface::template Description<>(); })
        return PointerFor<typename I::BaseInterface>(object, owner);
    else
        return nullptr;
}

// Type information of I: a process-wide object that lives as long as the program.
template <class I> class StaticTypeInfo final : public ITypeInfo {
  public:
    HRESULT QueryInterface(REFIID riid, void** out) override {
        if (out == nullptr)
            return E_POINTER;
        *out = (riid == IUnknown::iid || riid == ITypeInfo::iid) ? this : nullptr;
        return *out ? S_OK : E_NOINTERFACE;
    }
    ULONG AddRef() override { return 1; }
    ULONG Release() override { return 1; }
    HRESULT GetInterfaceDescription(const InterfaceDescription** out) override {
        if (out == nullptr)
            return E_POINTER;
        *out = &I::Description();
        return S_OK;
    }
};

HRESULT InvokeMember(void* self, const MemberDescription& member, DISPPARAMS* params, VARIANT* result,
                     EXCEPINFO* exception, UINT* argumentError);
HRESULT LookUpNames(const std::vector<DispatchMember>& members, LPOLESTR* names, UINT count, DISPID* ids);

} // namespace dispatch_detail

template <class I> class IDispatchImpl : public I {
    static_assert(std::is_base_of_v<IDispatch, I>, "IDispatchImpl serves dual interfaces only");

  public:
    HRESULT GetTypeInfoCount(UINT* count) override {
        if (count == nullptr)
            return E_POINTER;
        *count = 1;
        return S_OK;
    }
    HRESULT GetTypeInfo(UINT index, LCID, ITypeInfo** out) override {
        if (out == nullptr)
            return E_POINTER;
        *out = nullptr;
        if (index != 0)
            return DISP_E_BADINDEX;
        static dispatch_detail::StaticTypeInfo<I> info;
        *out = &info;
        return S_OK;
    }
    HRESULT GetIDsOfNames(REFIID, LPOLESTR* names, UINT count, LCID, DISPID* ids) override {
        return dispatch_detail::LookUpNames(Members(), names, count, ids);
    }
    HRESULT Invoke(DISPID id, REFIID, LCID, WORD flags, DISPPARAMS* params, VARIANT* result,
                   EXCEPINFO* exception, UINT* argumentError) override {
        const DispatchMember* member = FindMember(Members(), id);
        if (member == nullptr)
            return DISP_E_MEMBERNOTFOUND;
        const MemberDescription* form = SelectForm(*member, flags);
        if (form == nullptr)
            return DISP_E_MEMBERNOTFOUND;
        void* self = dispatch_detail::PointerFor<I>(static_cast<I*>(this), member->owner);
        return dispatch_detail::InvokeMember(self, *form, params, result, exception, argumentError);
    }

  private:
    static const std::vector<DispatchMember>& Members() {
        static const std::vector<DispatchMember> members = FlattenMembers(I::Description());
        return members;
    }
};

// The members of an interface chain under their dispatch identifiers, as IDispatch numbers them.
#pragma once

#include "platform/member_description.h"

#include <string_view>
#include <vector>

// One name of an interface chain: a property with its getter and setter, or a method.
struct DispatchMember {
    DISPID id;
    std::string_view name;
    const InterfaceDescription* owner; // the interface that declares the member
    const MemberDescription* get;
    const MemberDescription* put;
    const MemberDescription* method;
};

// Members of the interface and all its bases, root first; identifiers count from 1 in that order.
std::vector<DispatchMember> FlattenMembers(const InterfaceDescription& description);

// Case-insensitive lookup, as automation names are; null when there is no such member.
const DispatchMember* FindMember(const std::vector<DispatchMember>& members, std::string_view name);
const DispatchMember* FindMember(const std::vector<DispatchMember>& members, DISPID id);

// The member to call for a set of dispatch flags; null when the member has no such form.
const MemberDescription* SelectForm(const DispatchMember& member, WORD flags);

#include "platform/dispatch_members.h"

#include <algorithm>
#include <cctype>

namespace {

bool SameNameIgnoringCase(std::string_view a, std::string_view b) {
    return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin(), [](char x, char y) {
               return std::tolower(static_cast<unsigned char>(x)) ==
                      std::tolower(static_cast<unsigned char>(y));
           });
}

std::vector<const InterfaceDescription*> ChainFromRoot(const InterfaceDescription& description) {
    std::vector<const InterfaceDescription*> chain;
    for (const InterfaceDescription* d = &description; d != nullptr; d = d->base ? d->base() : nullptr)
        chain.push_back(d);
    std::reverse(chain.begin(), chain.end());
    return chain;
}

DispatchMember& EntryFor(std::vector<DispatchMember>& members, const InterfaceDescription* owner,
                         std::string_view name) {
    for (auto& m : members)
        if (m.owner == owner && m.name == name)
            return m;
    members.push_back({static_cast<DISPID>(members.size() + 1), name, owner, nullptr, nullptr, nullptr});
    return members.back();
}

} // namespace

std::vector<DispatchMember> FlattenMembers(const InterfaceDescription& description) {
    std::vector<DispatchMember> members;
    for (const InterfaceDescription* level : ChainFromRoot(description)) {
        for (const MemberDescription& m : level->members) {
            DispatchMember& entry = EntryFor(members, level, m.name);
            switch (m.kind) {
            case MemberKind::PropertyGet:
                entry.get = &m;
                break;
            case MemberKind::PropertyPut:
                entry.put = &m;
                break;
            case MemberKind::Method:
                entry.method = &m;
                break;
            }
        }
    }
    return members;
}

const DispatchMember* FindMember(const std::vector<DispatchMember>& members, std::string_view name) {
    // A derived interface's member hides a base member of the same name.
    for (auto it = members.rbegin(); it != members.rend(); ++it)
        if (SameNameIgnoringCase(it->name, name))
            return &*it;
    return nullptr;
}

const DispatchMember* FindMember(const std::vector<DispatchMember>& members, DISPID id) {
    if (id < 1 || static_cast<std::size_t>(id) > members.size())
        return nullptr;
    return &members[static_cast<std::size_t>(id - 1)];
}

const MemberDescription* SelectForm(const DispatchMember& member, WORD flags) {
    if (flags & (DISPATCH_PROPERTYPUT | DISPATCH_PROPERTYPUTREF))
        return member.put;
    if ((flags & DISPATCH_METHOD) && member.method)
        return member.method;
    if (flags & (DISPATCH_PROPERTYGET | DISPATCH_METHOD))
        return member.get;
    return nullptr;
}

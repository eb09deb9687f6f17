#include "module/system_messages.h"

#include <algorithm>
#include <array>

namespace Norvane {

namespace {

struct SystemMessageEntry {
    HRESULT hr;
    std::string_view text;
};

constexpr std::array kSystemMessages{
    SystemMessageEntry{E_INVALIDARG, "The parameter is incorrect."},
    SystemMessageEntry{E_POINTER, "Invalid pointer"},
    SystemMessageEntry{E_FAIL, "Unspecified error"},
    SystemMessageEntry{E_OUTOFMEMORY,
                       "Not enough memory resources are available to complete this operation."},
    SystemMessageEntry{E_NOTIMPL, "Not implemented"},
    SystemMessageEntry{E_UNEXPECTED, "Catastrophic failure"},
    SystemMessageEntry{E_NOINTERFACE, "No such interface supported"},
};

} // namespace

std::string_view SystemMessage(HRESULT hr) {
    const auto entry =
        std::ranges::find_if(kSystemMessages, [hr](const SystemMessageEntry& e) { return e.hr == hr; });
    return entry == kSystemMessages.end() ? std::string_view() : entry->text;
}

} // namespace Norvane

#include "platform/guid.h"

#include <cstdio>

std::optional<GUID> GuidFromString(std::string_view text) {
    return platform_detail::ParseGuid(text);
}

std::string GuidToString(const GUID& g) {
    char text[39];
    std::snprintf(text, sizeof text, "{%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X}", g.Data1, g.Data2,
                  g.Data3, g.Data4[0], g.Data4[1], g.Data4[2], g.Data4[3], g.Data4[4], g.Data4[5], g.Data4[6],
                  g.Data4[7]);
    return text;
}

int StringFromGUID2(const GUID& guid, OLECHAR* buffer, int capacity) {
    const std::string text = GuidToString(guid);
    const int needed = static_cast<int>(text.size()) + 1;
    if (buffer == nullptr || capacity < needed)
        return 0;
    for (std::size_t i = 0; i < text.size(); ++i)
        buffer[i] = static_cast<OLECHAR>(text[i]);
    buffer[text.size()] = u'\0';
    return needed;
}

std::size_t GuidHash::operator()(const GUID& g) const noexcept {
    std::size_t h = g.Data1;
    h = h * 1000003u ^ g.Data2;
    h = h * 1000003u ^ g.Data3;
    for (auto b : g.Data4)
        h = h * 1000003u ^ b;
    return h;
}

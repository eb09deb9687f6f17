#include "module/byte_text.h"

namespace Norvane {

std::u16string WidenBytes(std::string_view text) {
    std::u16string wide;
    wide.reserve(text.size());
    for (const char c : text)
        wide.push_back(static_cast<char16_t>(static_cast<unsigned char>(c)));
    return wide;
}

std::string NarrowToLowBytes(std::u16string_view text) {
    std::string narrow;
    narrow.reserve(text.size());
    for (const char16_t c : text)
        narrow.push_back(static_cast<char>(static_cast<unsigned char>(c & 0xFFu)));
    return narrow;
}

} // namespace Norvane

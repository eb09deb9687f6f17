#include "module/win32_error.h"

#include <cstdint>

namespace Norvane {

win32_error::win32_error(LONG code, const std::string& message) : std::runtime_error(message), code_(code) {}

HRESULT HResultFromWin32(LONG code) {
    if (code <= 0)
        return code;
    return MakeHResult((static_cast<std::uint32_t>(code) & 0xFFFFu) | 0x80070000u);
}

} // namespace Norvane

#include "tools/tool_error.h"

#include <cstdint>
#include <cstdio>

namespace Norvane::Lumis::Scanning::Tool {

std::string FormatHResult(HRESULT hr) {
    char text[16];
    std::snprintf(text, sizeof text, "0x%08X", static_cast<unsigned>(static_cast<std::uint32_t>(hr)));
    return text;
}

std::string DescribeFailure(const std::string& text, HRESULT hr, const std::string& fallback) {
    return (text.empty() ? fallback : text) + " (" + FormatHResult(hr) + ")";
}

} // namespace Norvane::Lumis::Scanning::Tool

// The failure the program reports as one line on standard error, naming where (a JSON path, an option or
// a step) and why. Every such failure ends the program with exit status 2.
#pragma once

#include "platform/com_types.h"

#include <stdexcept>
#include <string>

namespace Norvane::Lumis::Scanning::Tool {

class ToolError : public std::runtime_error {
  public:
    using std::runtime_error::runtime_error;
};

// The code as it is quoted in messages: "0x80070057".
std::string FormatHResult(HRESULT hr);

// "text (0x80070057)", or "fallback (0x80070057)" when the library gave no text.
std::string DescribeFailure(const std::string& text, HRESULT hr, const std::string& fallback);

} // namespace Norvane::Lumis::Scanning::Tool

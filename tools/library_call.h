// Checks of direct interface calls into the library: a failed call becomes a ToolError carrying the
// library's own error text and HRESULT.
#pragma once

#include "platform/com_types.h"

#include <string>
#include <string_view>

namespace Norvane::Lumis::Scanning::Tool {

// The description of the calling thread's error information, taken out of its slot; empty when the
// failed call left none.
std::string TakeErrorText();

// Throws ToolError "step: <library text> (0x...)" for a failed hr; success codes pass through.
HRESULT CheckCall(HRESULT hr, std::string_view step);

} // namespace Norvane::Lumis::Scanning::Tool

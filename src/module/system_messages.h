// The platform's system message texts for the result codes the library reports.
#pragma once

#include "platform/com_types.h"

#include <string_view>

namespace Norvane {

// The system's text for hr without trailing white space, or empty when the table has none.
std::string_view SystemMessage(HRESULT hr);

} // namespace Norvane

// Plain JSON values as automation values: what a job file passes for a number, a boolean or a string.
#pragma once

#include "platform/variant.h"
#include "tools/job_json.h"

#include <optional>

namespace Norvane::Lumis::Scanning::Tool {

// Integers become VT_I4, or VT_I8 (VT_UI8 above the signed range) when they do not fit; other numbers
// VT_R8, booleans VT_BOOL, strings VT_BSTR and null VT_NULL. The automation layer converts them to the
// member's type and refuses what does not fit. Empty for arrays and objects.
std::optional<CComVariant> ScalarVariant(const Json& value);

// What a member of the given automation type takes, in words: "a number", "true or false", ...
const char* ExpectedValue(VARTYPE vt);

} // namespace Norvane::Lumis::Scanning::Tool

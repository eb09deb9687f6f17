// Making validation results, and reading one back into plain values for the render steps.
#pragma once

#include "platform/com_ptr.h"

#include <beamweaver/pattern.h>

#include <optional>
#include <string>

namespace Norvane::Lumis::Scanning {

// A new result holding valid and a copy of description; nullopt gives a null description.
CComPtr<IPatternValidationResult> MakeValidationResult(bool valid,
                                                       const std::optional<std::u16string>& description);

// A new result that is valid with the description "OK".
CComPtr<IPatternValidationResult> MakeValidResult();

struct ValidationOutcome {
    bool valid;
    std::u16string description;
};

// Reads both values through the interface; a null description reads as empty. A failed call is
// thrown with the result object's error information, a null result as std::invalid_argument.
ValidationOutcome ReadValidationResult(IPatternValidationResult* result);

} // namespace Norvane::Lumis::Scanning

#include "core/validation.h"

#include "core/pattern_validation_result.h"
#include "module/error_reporting.h"

#include <stdexcept>

namespace Norvane::Lumis::Scanning {

CComPtr<IPatternValidationResult> MakeValidationResult(bool valid,
                                                       const std::optional<std::u16string>& description) {
    return CComObjectEx<CPatternValidationResult>::CreateInstance<IPatternValidationResult>(valid,
                                                                                            description);
}

CComPtr<IPatternValidationResult> MakeValidResult() {
    return MakeValidationResult(true, u"OK");
}

ValidationOutcome ReadValidationResult(IPatternValidationResult* result) {
    if (result == nullptr)
        throw std::invalid_argument("validation result object is null");
    VARIANT_BOOL valid = VARIANT_FALSE;
    CheckResult(result->get_Valid(&valid));
    CComBSTR description;
    CheckResult(result->get_Description(&description));
    return {valid != VARIANT_FALSE, std::u16string(description.View())};
}

} // namespace Norvane::Lumis::Scanning

#include "core/pattern_validation_result.h"

#include "module/method_guard.h"

#include <utility>

namespace Norvane::Lumis::Scanning {

CPatternValidationResult::CPatternValidationResult(bool valid, std::optional<std::u16string> description)
    : valid_(valid), description_(std::move(description)) {}

HRESULT CPatternValidationResult::get_Valid(VARIANT_BOOL* value) {
    return Guarded(IID_IPatternValidationResult, value, [&] { *value = ToVariantBool(valid_); });
}

HRESULT CPatternValidationResult::get_Description(BSTR* value) {
    return Guarded(IID_IPatternValidationResult, value, [&] {
        *value = nullptr;
        if (description_)
            *value = CComBSTR(*description_).Detach();
    });
}

} // namespace Norvane::Lumis::Scanning

// The answer of a pattern's Validate: whether it can be rendered and, if not, why. Immutable and
// free-threaded; the description may be null, which is not the same as empty for the client.
#pragma once

#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/pattern.h>

#include <optional>
#include <string>

namespace Norvane::Lumis::Scanning {

class CPatternValidationResult : public CComObjectRootBase, public IDispatchImpl<IPatternValidationResult> {
  public:
    using Interfaces = InterfaceMap<IPatternValidationResult>;

    CPatternValidationResult(bool valid, std::optional<std::u16string> description);

    HRESULT get_Valid(VARIANT_BOOL* value) override;
    // A new string for the caller; a null description comes out as a null string.
    HRESULT get_Description(BSTR* value) override;

  private:
    const bool valid_;
    const std::optional<std::u16string> description_;
};

} // namespace Norvane::Lumis::Scanning

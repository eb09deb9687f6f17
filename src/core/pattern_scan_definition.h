// The render output of every non-raster pattern: the shared scan-definition values plus whether the
// scan device may navigate between sub patterns and whether it blanks the beam between them.
#pragma once

#include "core/scan_definition_impl.h"
#include "platform/object.h"

namespace Norvane::Lumis::Scanning {

class CPatternScanDefinition : public CComObjectRootBase, public IScanDefinitionImpl<IPatternScanDefinition> {
  public:
    using Interfaces = InterfaceMap<IPatternScanDefinition>;

    CPatternScanDefinition(ISubPatternCollection* subPatterns,
                           ScanSynchronizationSource scanSynchronizationSource,
                           std::uint32_t gatePulseIdleTicks, std::uint32_t acquisitionUpdatePoints,
                           bool allowSubPatternNavigation, bool blankBeamBetweenSubPatterns);

    HRESULT get_AllowSubPatternNavigation(VARIANT_BOOL* value) override;
    HRESULT get_BlankBeamBetweenSubPatterns(VARIANT_BOOL* value) override;

  private:
    const bool allowSubPatternNavigation_;
    const bool blankBeamBetweenSubPatterns_;
};

} // namespace Norvane::Lumis::Scanning

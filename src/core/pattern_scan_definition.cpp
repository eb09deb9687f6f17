#include "core/pattern_scan_definition.h"

namespace Norvane::Lumis::Scanning {

CPatternScanDefinition::CPatternScanDefinition(ISubPatternCollection* subPatterns,
                                               ScanSynchronizationSource scanSynchronizationSource,
                                               std::uint32_t gatePulseIdleTicks,
                                               std::uint32_t acquisitionUpdatePoints,
                                               bool allowSubPatternNavigation,
                                               bool blankBeamBetweenSubPatterns)
    : IScanDefinitionImpl(subPatterns, scanSynchronizationSource, gatePulseIdleTicks,
                          acquisitionUpdatePoints),
      allowSubPatternNavigation_(allowSubPatternNavigation),
      blankBeamBetweenSubPatterns_(blankBeamBetweenSubPatterns) {}

HRESULT CPatternScanDefinition::get_AllowSubPatternNavigation(VARIANT_BOOL* value) {
    return Guarded(IID_IPatternScanDefinition, value,
                   [&] { *value = ToVariantBool(allowSubPatternNavigation_); });
}

HRESULT CPatternScanDefinition::get_BlankBeamBetweenSubPatterns(VARIANT_BOOL* value) {
    return Guarded(IID_IPatternScanDefinition, value,
                   [&] { *value = ToVariantBool(blankBeamBetweenSubPatterns_); });
}

} // namespace Norvane::Lumis::Scanning

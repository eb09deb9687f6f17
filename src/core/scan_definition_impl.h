// The part every scan definition shares: the rendered sub-pattern collection and the three values the
// scan device needs for any pattern. I is the scan-definition interface the class serves.
// Scan definitions are immutable and free-threaded: every field is set once by the constructor and
// only read afterwards, so no lock is taken.
#pragma once

#include "module/method_guard.h"
#include "platform/dispatch_impl.h"

#include <beamweaver/scan_definition.h>

#include <cstdint>
#include <type_traits>

namespace Norvane::Lumis::Scanning {

template <class I> class IScanDefinitionImpl : public IDispatchImpl<I> {
    static_assert(std::is_base_of_v<IScanDefinition, I>, "IScanDefinitionImpl serves scan definitions");

  public:
    HRESULT get_SubPatternCollection(ISubPatternCollection** value) override {
        return Guarded(IID_IScanDefinition, value, [&] { return subPatterns_.CopyTo(value); });
    }
    HRESULT get_ScanSynchronizationSource(ScanSynchronizationSource* value) override {
        return Guarded(IID_IScanDefinition, value, [&] { *value = scanSynchronizationSource_; });
    }
    HRESULT get_GatePulseIdleTicks(std::uint32_t* value) override {
        return Guarded(IID_IScanDefinition, value, [&] { *value = gatePulseIdleTicks_; });
    }
    HRESULT get_AcquisitionUpdatePoints(std::uint32_t* value) override {
        return Guarded(IID_IScanDefinition, value, [&] { *value = acquisitionUpdatePoints_; });
    }

  protected:
    IScanDefinitionImpl(ISubPatternCollection* subPatterns,
                        ScanSynchronizationSource scanSynchronizationSource, std::uint32_t gatePulseIdleTicks,
                        std::uint32_t acquisitionUpdatePoints)
        : subPatterns_(subPatterns), scanSynchronizationSource_(scanSynchronizationSource),
          gatePulseIdleTicks_(gatePulseIdleTicks), acquisitionUpdatePoints_(acquisitionUpdatePoints) {}

  private:
    const CComPtr<ISubPatternCollection> subPatterns_;
    const ScanSynchronizationSource scanSynchronizationSource_;
    const std::uint32_t gatePulseIdleTicks_;
    const std::uint32_t acquisitionUpdatePoints_;
};

} // namespace Norvane::Lumis::Scanning

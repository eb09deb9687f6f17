// An integer range value: minimum and maximum as signed 32-bit numbers.
// Free-threaded without a lock: every property is one load or store, and any value is accepted.
#pragma once

#include "comtypes/value_property.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/comtypes.h>

namespace Norvane::ComTypes {

class CRangeInt : public CComObjectRootBase, public IDispatchImpl<IRangeInt> {
  public:
    using Interfaces = InterfaceMap<IRangeInt>;

    HRESULT get_Minimum(std::int32_t* value) override;
    HRESULT put_Minimum(std::int32_t value) override;
    HRESULT get_Maximum(std::int32_t* value) override;
    HRESULT put_Maximum(std::int32_t value) override;

  private:
    ValueProperty<std::int32_t> minimum_;
    ValueProperty<std::int32_t> maximum_;
};

} // namespace Norvane::ComTypes

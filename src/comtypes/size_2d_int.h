// An integer size value: width and height as signed 32-bit numbers.
// Free-threaded without a lock: every property is one load or store, and any value is accepted.
#pragma once

#include "comtypes/value_property.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/comtypes.h>

namespace Norvane::ComTypes {

class CSize2DInt : public CComObjectRootBase, public IDispatchImpl<ISize2DInt> {
  public:
    using Interfaces = InterfaceMap<ISize2DInt>;

    HRESULT get_Width(std::int32_t* value) override;
    HRESULT put_Width(std::int32_t value) override;
    HRESULT get_Height(std::int32_t* value) override;
    HRESULT put_Height(std::int32_t value) override;

  private:
    ValueProperty<std::int32_t> width_;
    ValueProperty<std::int32_t> height_;
};

} // namespace Norvane::ComTypes

// An integer rectangle value: left, top, right and bottom as signed 32-bit numbers.
// Free-threaded without a lock: every property is one load or store, and any value is accepted.
#pragma once

#include "comtypes/value_property.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/comtypes.h>

namespace Norvane::ComTypes {

class CRectangleInt : public CComObjectRootBase, public IDispatchImpl<IRectangleInt> {
  public:
    using Interfaces = InterfaceMap<IRectangleInt>;

    HRESULT get_Left(std::int32_t* value) override;
    HRESULT put_Left(std::int32_t value) override;
    HRESULT get_Top(std::int32_t* value) override;
    HRESULT put_Top(std::int32_t value) override;
    HRESULT get_Right(std::int32_t* value) override;
    HRESULT put_Right(std::int32_t value) override;
    HRESULT get_Bottom(std::int32_t* value) override;
    HRESULT put_Bottom(std::int32_t value) override;

  private:
    ValueProperty<std::int32_t> left_;
    ValueProperty<std::int32_t> top_;
    ValueProperty<std::int32_t> right_;
    ValueProperty<std::int32_t> bottom_;
};

} // namespace Norvane::ComTypes

// A coordinate value: X and Y as doubles.
// Free-threaded without a lock: every property is one load or store, and any value is accepted.
#pragma once

#include "comtypes/value_property.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/comtypes.h>

namespace Norvane::ComTypes {

class CCoordinateFloat : public CComObjectRootBase, public IDispatchImpl<ICoordinateFloat> {
  public:
    using Interfaces = InterfaceMap<ICoordinateFloat>;

    HRESULT get_X(double* value) override;
    HRESULT put_X(double value) override;
    HRESULT get_Y(double* value) override;
    HRESULT put_Y(double value) override;

  private:
    ValueProperty<double> x_;
    ValueProperty<double> y_;
};

} // namespace Norvane::ComTypes

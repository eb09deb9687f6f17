// A floating rectangle value: left, top, right and bottom as doubles.
// Free-threaded without a lock: every property is one load or store, and any value is accepted.
#pragma once

#include "comtypes/value_property.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/comtypes.h>

namespace Norvane::ComTypes {

class CRectangleFloat : public CComObjectRootBase, public IDispatchImpl<IRectangleFloat> {
  public:
    using Interfaces = InterfaceMap<IRectangleFloat>;

    HRESULT get_Left(double* value) override;
    HRESULT put_Left(double value) override;
    HRESULT get_Top(double* value) override;
    HRESULT put_Top(double value) override;
    HRESULT get_Right(double* value) override;
    HRESULT put_Right(double value) override;
    HRESULT get_Bottom(double* value) override;
    HRESULT put_Bottom(double value) override;

  private:
    ValueProperty<double> left_;
    ValueProperty<double> top_;
    ValueProperty<double> right_;
    ValueProperty<double> bottom_;
};

} // namespace Norvane::ComTypes

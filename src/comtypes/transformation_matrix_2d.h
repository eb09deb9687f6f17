// An affine matrix value: (x, y) maps to (M0·x + M1·y + M2, M3·x + M4·y + M5).
// Free-threaded without a lock: every property is one load or store, and any value is accepted.
// A new object holds the identity.
#pragma once

#include "comtypes/value_property.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/comtypes.h>

namespace Norvane::ComTypes {

class CTransformationMatrix2D : public CComObjectRootBase, public IDispatchImpl<ITransformationMatrix2D> {
  public:
    using Interfaces = InterfaceMap<ITransformationMatrix2D>;

    HRESULT get_M0(double* value) override;
    HRESULT put_M0(double value) override;
    HRESULT get_M1(double* value) override;
    HRESULT put_M1(double value) override;
    HRESULT get_M2(double* value) override;
    HRESULT put_M2(double value) override;
    HRESULT get_M3(double* value) override;
    HRESULT put_M3(double value) override;
    HRESULT get_M4(double* value) override;
    HRESULT put_M4(double value) override;
    HRESULT get_M5(double* value) override;
    HRESULT put_M5(double value) override;

  private:
    ValueProperty<double> m0_{1.0};
    ValueProperty<double> m1_;
    ValueProperty<double> m2_;
    ValueProperty<double> m3_;
    ValueProperty<double> m4_{1.0};
    ValueProperty<double> m5_;
};

} // namespace Norvane::ComTypes

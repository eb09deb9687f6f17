// The integer size the library hands out itself (the image size of a raster scan definition).
// Free-threaded; width and height are guarded by the object's own lock.
#pragma once

#include "module/geometry_values.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/comtypes.h>

#include <mutex>

namespace Norvane::Lumis::Common {

class CSizeInt : public CComObjectRootBase, public IDispatchImpl<ISizeInt> {
  public:
    using Interfaces = InterfaceMap<ISizeInt>;

    CSizeInt() = default;
    explicit CSizeInt(const SizeInt& value) : size_(value) {}

    HRESULT get_Width(std::int32_t* value) override;
    HRESULT put_Width(std::int32_t value) override;
    HRESULT get_Height(std::int32_t* value) override;
    HRESULT put_Height(std::int32_t value) override;

  private:
    HRESULT Load(std::int32_t SizeInt::*field, std::int32_t* out);
    HRESULT Store(std::int32_t SizeInt::*field, std::int32_t value);

    std::mutex mutex_;
    SizeInt size_;
};

// A new size object holding a copy of value; the caller owns the one reference.
CComPtr<ISizeInt> CreateSizeInt(const SizeInt& value);

} // namespace Norvane::Lumis::Common

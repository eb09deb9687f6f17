// The integer rectangle the library hands out itself, for an interface I that is IRectangleInt or
// derives from it. Free-threaded; the four fields are guarded by the object's own lock.
#pragma once

#include "module/geometry_values.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/comtypes.h>

#include <mutex>
#include <type_traits>

namespace Norvane::Lumis::Common {

template <class I> class CRectangleIntImpl : public CComObjectRootBase, public IDispatchImpl<I> {
    static_assert(std::is_base_of_v<IRectangleInt, I>, "CRectangleIntImpl serves integer rectangles");

  public:
    using Interfaces = InterfaceMap<I>;

    CRectangleIntImpl() = default;
    explicit CRectangleIntImpl(const RectangleInt& value) : rectangle_(value) {}

    HRESULT get_Left(std::int32_t* value) override;
    HRESULT put_Left(std::int32_t value) override;
    HRESULT get_Top(std::int32_t* value) override;
    HRESULT put_Top(std::int32_t value) override;
    HRESULT get_Right(std::int32_t* value) override;
    HRESULT put_Right(std::int32_t value) override;
    HRESULT get_Bottom(std::int32_t* value) override;
    HRESULT put_Bottom(std::int32_t value) override;

  private:
    HRESULT Load(std::int32_t RectangleInt::*field, std::int32_t* out);
    HRESULT Store(std::int32_t RectangleInt::*field, std::int32_t value);

    std::mutex mutex_;
    RectangleInt rectangle_;
};

extern template class CRectangleIntImpl<IRectangleInt>;

// A new rectangle object holding a copy of value; the caller owns the one reference.
CComPtr<IRectangleInt> CreateRectangleIntImpl(const RectangleInt& value);

} // namespace Norvane::Lumis::Common

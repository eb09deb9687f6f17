#include "module/rectangle_int_impl.h"

#include "module/method_guard.h"

namespace Norvane::Lumis::Common {

template <class I> HRESULT CRectangleIntImpl<I>::get_Left(std::int32_t* value) {
    return Load(&RectangleInt::left, value);
}

template <class I> HRESULT CRectangleIntImpl<I>::put_Left(std::int32_t value) {
    return Store(&RectangleInt::left, value);
}

template <class I> HRESULT CRectangleIntImpl<I>::get_Top(std::int32_t* value) {
    return Load(&RectangleInt::top, value);
}

template <class I> HRESULT CRectangleIntImpl<I>::put_Top(std::int32_t value) {
    return Store(&RectangleInt::top, value);
}

template <class I> HRESULT CRectangleIntImpl<I>::get_Right(std::int32_t* value) {
    return Load(&RectangleInt::right, value);
}

template <class I> HRESULT CRectangleIntImpl<I>::put_Right(std::int32_t value) {
    return Store(&RectangleInt::right, value);
}

template <class I> HRESULT CRectangleIntImpl<I>::get_Bottom(std::int32_t* value) {
    return Load(&RectangleInt::bottom, value);
}

template <class I> HRESULT CRectangleIntImpl<I>::put_Bottom(std::int32_t value) {
    return Store(&RectangleInt::bottom, value);
}

template <class I> HRESULT CRectangleIntImpl<I>::Load(std::int32_t RectangleInt::*field, std::int32_t* out) {
    return Guarded(IID_IRectangleInt, out, [&] {
        std::lock_guard lock(mutex_);
        *out = rectangle_.*field;
    });
}

template <class I>
HRESULT CRectangleIntImpl<I>::Store(std::int32_t RectangleInt::*field, std::int32_t value) {
    return Guarded(IID_IRectangleInt, [&] {
        std::lock_guard lock(mutex_);
        rectangle_.*field = value;
    });
}

template class CRectangleIntImpl<IRectangleInt>;

CComPtr<IRectangleInt> CreateRectangleIntImpl(const RectangleInt& value) {
    return CComObjectEx<CRectangleIntImpl<IRectangleInt>>::CreateInstance<IRectangleInt>(value);
}

} // namespace Norvane::Lumis::Common

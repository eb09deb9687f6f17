#include "module/size_int.h"

#include "module/method_guard.h"

namespace Norvane::Lumis::Common {

HRESULT CSizeInt::get_Width(std::int32_t* value) {
    return Load(&SizeInt::width, value);
}

HRESULT CSizeInt::put_Width(std::int32_t value) {
    return Store(&SizeInt::width, value);
}

HRESULT CSizeInt::get_Height(std::int32_t* value) {
    return Load(&SizeInt::height, value);
}

HRESULT CSizeInt::put_Height(std::int32_t value) {
    return Store(&SizeInt::height, value);
}

HRESULT CSizeInt::Load(std::int32_t SizeInt::*field, std::int32_t* out) {
    return Guarded(IID_ISizeInt, out, [&] {
        std::lock_guard lock(mutex_);
        *out = size_.*field;
    });
}

HRESULT CSizeInt::Store(std::int32_t SizeInt::*field, std::int32_t value) {
    return Guarded(IID_ISizeInt, [&] {
        std::lock_guard lock(mutex_);
        size_.*field = value;
    });
}

CComPtr<ISizeInt> CreateSizeInt(const SizeInt& value) {
    return CComObjectEx<CSizeInt>::CreateInstance<ISizeInt>(value);
}

} // namespace Norvane::Lumis::Common

// The one shape of every public method: check the out pointer, take the object's lock, run the work,
// and turn anything thrown into the method's HRESULT plus error information for its interface.
//
//     HRESULT CPatternLine::put_Pitch(double value) {
//         return Guarded(IID_IPatternLine, mutex_, [&] {
//             if (!(value > 0.0 && value < 1.0)) return E_INVALIDARG;
//             pitch_ = value;
//             return S_OK;
//         });
//     }
//
// A body returns an HRESULT, or nothing for S_OK. The overloads with an out pointer return E_POINTER
// for a null one before anything else, without error information. Every call starts with the thread's
// error information empty, so a failure without a message reads as just that.
#pragma once

#include "module/error_reporting.h"
#include "platform/error_info.h"

#include <boost/thread/lock_types.hpp>
#include <boost/thread/recursive_mutex.hpp>

#include <type_traits>
#include <utility>

namespace Norvane {

using ObjectMutex = boost::recursive_mutex;

namespace guard_detail {

// Empties the thread's error information: a method that then fails without a message must not leave an
// earlier, unrelated description for its caller's call check to pick up.
inline void ClearThreadErrorInfo() { SetErrorInfo(0, nullptr); }

template <class Body> HRESULT RunBody(Body& body) {
    if constexpr (std::is_void_v<std::invoke_result_t<Body&>>) {
        body();
        return S_OK;
    } else {
        return body();
    }
}

} // namespace guard_detail

template <class Body> HRESULT Guarded(REFIID riid, Body&& body) {
    guard_detail::ClearThreadErrorInfo();
    try {
        return guard_detail::RunBody(body);
    } catch (...) {
        return TranslateCurrentException(riid);
    }
}

template <class Body> HRESULT Guarded(REFIID riid, ObjectMutex& mutex, Body&& body) {
    guard_detail::ClearThreadErrorInfo();
    try {
        boost::unique_lock<ObjectMutex> lock(mutex);
        return guard_detail::RunBody(body);
    } catch (...) {
        return TranslateCurrentException(riid);
    }
}

template <class Out, class Body> HRESULT Guarded(REFIID riid, Out* out, Body&& body) {
    if (out == nullptr) {
        guard_detail::ClearThreadErrorInfo();
        return E_POINTER;
    }
    return Guarded(riid, std::forward<Body>(body));
}

template <class Out, class Body> HRESULT Guarded(REFIID riid, ObjectMutex& mutex, Out* out, Body&& body) {
    if (out == nullptr) {
        guard_detail::ClearThreadErrorInfo();
        return E_POINTER;
    }
    return Guarded(riid, mutex, std::forward<Body>(body));
}

} // namespace Norvane

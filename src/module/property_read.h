// Reading a property of another object through its interface, with the call check applied.
#pragma once

#include "module/error_reporting.h"
#include "platform/com_ptr.h"

namespace Norvane {

// Calls one getter of object and returns its value; a failure throws with the callee's error information.
template <class Object, class Declaring, class T> T ReadValue(Object* object, HRESULT (Declaring::*getter)(T*)) {
    T value{};
    CheckResult((object->*getter)(&value));
    return value;
}

// Calls a getter that hands out an object; the caller owns the reference.
template <class Object, class Declaring, class I>
CComPtr<I> ReadObject(Object* object, HRESULT (Declaring::*getter)(I**)) {
    CComPtr<I> value;
    CheckResult((object->*getter)(&value));
    return value;
}

} // namespace Norvane

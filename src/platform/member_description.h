// Descriptions of interface members, built at compile time from the interface's one member list.
//
// Every interface declares its members once, as a list macro:
//
//     #define IPatternLine_MEMBERS(X)  (each line but the last ends in a backslash)
//         X(PROP, ICoordinateFloat*, Begin)
//         X(GET, double, Valid)
//         X(METHOD, GetEffectiveLoopTime, (double* loopTime))
//     BW_INTERFACE(IPatternLine, IPatternShape, IPatternLine_MEMBERS);
//
// The same list declares the pure virtual methods (get_Begin/put_Begin, get_Valid, GetEffectiveLoopTime)
// and a table of descriptions: name, kind, parameter types and an invoker that calls the method with
// arguments converted from automation values. IDispatch, job files and language bindings read that table.
// A method's last pointer parameter of an automation type is its result.
#pragma once

#include "platform/com_ptr.h"
#include "platform/dispatch.h"

#include <cmath>
#include <cstddef>
#include <limits>
#include <span>
#include <tuple>
#include <type_traits>
#include <utility>

enum class MemberKind : std::uint8_t { PropertyGet, PropertyPut, Method };

// An automation type: the variant type, and for interface types the interface identifier.
struct ParamType {
    VARTYPE vt;
    const IID* iid;
};

// How a call through the table ended: the method's result, or the argument that could not be converted.
struct InvokeOutcome {
    HRESULT hr;
    bool called;
    UINT badArgument;
};

struct MemberDescription {
    const char* name;
    MemberKind kind;
    std::span<const ParamType> params; // inputs, in declaration order
    ParamType result;                  // VT_EMPTY when the member returns nothing
    // Calls the member on the interface pointer (of the interface that declares it) with arguments in
    // declaration order; result, when not null, receives the out value.
    InvokeOutcome (*invoke)(void* self, VARIANT* args, VARIANT* result);
};

struct InterfaceDescription {
    const char* name;
    const IID* iid;
    const InterfaceDescription* (*base)(); // null for an interface directly on IUnknown or IDispatch
    std::span<const MemberDescription> members;
};

namespace dispatch_detail {

template <class T> struct AutomationType;

template <class T>
concept Automation = requires {
    AutomationType<T>::vt;
};

template <VARTYPE V> struct Simple {
    static constexpr VARTYPE vt = V;
    static constexpr const IID* iid = nullptr;
};

template <> struct AutomationType<double> : Simple<VT_R8> {};
template <> struct AutomationType<std::int32_t> : Simple<VT_I4> {};
template <> struct AutomationType<std::uint32_t> : Simple<VT_UI4> {};
template <> struct AutomationType<std::int16_t> : Simple<VT_I2> {};
template <> struct AutomationType<std::uint16_t> : Simple<VT_UI2> {};
template <> struct AutomationType<std::uint8_t> : Simple<VT_UI1> {};
template <> struct AutomationType<VARIANT_BOOL> : Simple<VT_BOOL> {};
template <> struct AutomationType<BSTR> : Simple<VT_BSTR> {};
template <> struct AutomationType<VARIANT> : Simple<VT_VARIANT> {};
// Identifiers cross automation as their registry form, "{D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1}".
template <> struct AutomationType<GUID> : Simple<VT_BSTR> {};

template <class E>
requires std::is_enum_v<E> &&(!std::is_same_v<E, VARIANT_BOOL>)struct AutomationType<E> : Simple<VT_I4> {
};

template <class I>
requires std::is_base_of_v<IUnknown, I>
struct AutomationType<I*> {
    static constexpr VARTYPE vt = std::is_base_of_v<IDispatch, I> ? VT_DISPATCH : VT_UNKNOWN;
    static constexpr const IID* iid = &I::iid;
};

template <class T> constexpr ParamType TypeOf() {
    return {AutomationType<T>::vt, AutomationType<T>::iid};
}

// ---- reading arguments -------------------------------------------------------------------------

bool IsInteger(const VARIANT& v);
bool IsFloating(const VARIANT& v);
std::int64_t IntegerOf(const VARIANT& v); // only for integer variants
std::uint64_t UnsignedOf(const VARIANT& v);
double FloatingOf(const VARIANT& v); // only for floating variants
bool IsNullObject(const VARIANT& v);
IUnknown* ObjectOf(const VARIANT& v); // only for VT_UNKNOWN / VT_DISPATCH

// Integral targets take integers in range, or floating values that are whole and in range; nothing is
// rounded or wrapped.
template <class T> HRESULT ReadIntegral(const VARIANT& v, T& out) {
    using Limits = std::numeric_limits<T>;
    if (IsInteger(v)) {
        if (v.vt == VT_UI8 && UnsignedOf(v) > static_cast<std::uint64_t>(Limits::max()))
            return DISP_E_OVERFLOW;
        const std::int64_t value = IntegerOf(v);
        if (v.vt != VT_UI8 &&
            (value < static_cast<std::int64_t>(Limits::min()) ||
             (value > 0 && static_cast<std::uint64_t>(value) > static_cast<std::uint64_t>(Limits::max()))))
            return DISP_E_OVERFLOW;
        out = static_cast<T>(value);
        return S_OK;
    }
    if (IsFloating(v)) {
        const double value = FloatingOf(v);
        if (!std::isfinite(value) || std::trunc(value) != value)
            return DISP_E_TYPEMISMATCH;
        if (value < static_cast<double>(Limits::min()) || value > static_cast<double>(Limits::max()))
            return DISP_E_OVERFLOW;
        out = static_cast<T>(value);
        return S_OK;
    }
    return DISP_E_TYPEMISMATCH;
}

template <class T> struct Argument {
    T value{};
    HRESULT Load(const VARIANT& v) {
        if constexpr (std::is_floating_point_v<T>) {
            if (IsFloating(v))
                value = static_cast<T>(FloatingOf(v));
            else if (IsInteger(v))
                value = static_cast<T>(v.vt == VT_UI8 ? static_cast<double>(UnsignedOf(v))
                                                      : static_cast<double>(IntegerOf(v)));
            else
                return DISP_E_TYPEMISMATCH;
            return S_OK;
        } else if constexpr (std::is_enum_v<T>) {
            std::int32_t raw = 0;
            const HRESULT hr = ReadIntegral(v, raw);
            value = static_cast<T>(raw);
            return hr;
        } else {
            return ReadIntegral(v, value);
        }
    }
    T Get() const { return value; }
};

template <> struct Argument<VARIANT_BOOL> {
    VARIANT_BOOL value = VARIANT_FALSE;
    HRESULT Load(const VARIANT& v) {
        if (v.vt != VT_BOOL)
            return DISP_E_TYPEMISMATCH;
        value = v.boolVal;
        return S_OK;
    }
    VARIANT_BOOL Get() const { return value; }
};

template <> struct Argument<BSTR> {
    BSTR value = nullptr;
    HRESULT Load(const VARIANT& v) {
        if (v.vt == VT_BSTR)
            value = v.bstrVal;
        else if (v.vt != VT_EMPTY && v.vt != VT_NULL)
            return DISP_E_TYPEMISMATCH;
        return S_OK;
    }
    BSTR Get() const { return value; }
};

template <> struct Argument<GUID> {
    GUID value{};
    HRESULT Load(const VARIANT& v);
    GUID Get() const { return value; }
};

template <> struct Argument<VARIANT> {
    VARIANT value{};
    HRESULT Load(const VARIANT& v) {
        value = v;
        return S_OK;
    }
    VARIANT Get() const { return value; }
};

template <class I> struct Argument<I*> {
    CComPtr<I> value;
    HRESULT Load(const VARIANT& v) {
        if (IsNullObject(v))
            return S_OK;
        if (v.vt != VT_UNKNOWN && v.vt != VT_DISPATCH)
            return DISP_E_TYPEMISMATCH;
        value = QueryAs<I>(ObjectOf(v));
        return value ? S_OK : DISP_E_TYPEMISMATCH;
    }
    I* Get() const { return value; }
};

// ---- writing the result ------------------------------------------------------------------------

template <class T> struct Result {
    T value{};
    T* Address() { return &value; }
    void Store(VARIANT* out) {
        out->vt = AutomationType<T>::vt;
        if constexpr (std::is_same_v<T, double>)
            out->dblVal = value;
        else if constexpr (std::is_same_v<T, VARIANT_BOOL>)
            out->boolVal = value;
        else if constexpr (std::is_enum_v<T>)
            out->lVal = static_cast<std::int32_t>(value);
        else if constexpr (std::is_same_v<T, std::int32_t>)
            out->lVal = value;
        else if constexpr (std::is_same_v<T, std::uint32_t>)
            out->ulVal = value;
        else if constexpr (std::is_same_v<T, std::int16_t>)
            out->iVal = value;
        else if constexpr (std::is_same_v<T, std::uint16_t>)
            out->uiVal = value;
        else
            out->bVal = value;
    }
};

template <> struct Result<BSTR> {
    CComBSTR value;
    BSTR* Address() { return &value; }
    void Store(VARIANT* out) {
        out->vt = VT_BSTR;
        out->bstrVal = value.Detach();
    }
};

template <> struct Result<GUID> {
    GUID value{};
    GUID* Address() { return &value; }
    void Store(VARIANT* out);
};

template <> struct Result<VARIANT> {
    CComVariant value;
    VARIANT* Address() { return &value; }
    void Store(VARIANT* out) { value.Detach(out); }
};

template <class I> struct Result<I*> {
    CComPtr<I> value;
    I** Address() { return &value; }
    void Store(VARIANT* out) {
        if constexpr (std::is_base_of_v<IDispatch, I>) {
            out->vt = VT_DISPATCH;
            out->pdispVal = value.Detach();
        } else {
            out->vt = VT_UNKNOWN;
            out->punkVal = value.Detach();
        }
    }
};

// ---- signatures --------------------------------------------------------------------------------

template <class P>
constexpr bool IsResultParameter =
    std::is_pointer_v<P> && !Automation<P> && Automation<std::remove_pointer_t<P>>;

template <class F> struct Signature;

template <class C, class... Ps> struct Signature<HRESULT (C::*)(Ps...)> {
    using Class = C;
    using Params = std::tuple<Ps...>;
    static constexpr std::size_t count = sizeof...(Ps);
    // The last parameter, or void* standing in for it when there is none (void* is never a result).
    using Last = std::tuple_element_t<(count > 0 ? count - 1 : 0), std::tuple<Ps..., void*>>;
    static constexpr bool hasResult = IsResultParameter<Last>;
    static constexpr std::size_t inputs = hasResult ? count - 1 : count;

    template <std::size_t I> using Input = std::tuple_element_t<I, Params>;
    using ResultType = std::conditional_t<hasResult, std::remove_pointer_t<Last>, void>;
};

template <auto Fn, std::size_t... I> constexpr auto InputTypes(std::index_sequence<I...>) {
    using S = Signature<decltype(Fn)>;
    static_assert((Automation<typename S::template Input<I>> && ...), "parameter of a non-automation type");
    return std::array<ParamType, sizeof...(I)>{TypeOf<typename S::template Input<I>>()...};
}

template <auto Fn>
inline constexpr auto
    kInputTypes = InputTypes<Fn>(std::make_index_sequence<Signature<decltype(Fn)>::inputs>());

template <auto Fn, std::size_t... I>
InvokeOutcome Call(void* self, VARIANT* args, VARIANT* result, std::index_sequence<I...>) {
    using S = Signature<decltype(Fn)>;
    auto* object = static_cast<typename S::Class*>(self);
    std::tuple<Argument<typename S::template Input<I>>...> arguments;
    HRESULT hr = S_OK;
    UINT bad = 0;
    (void)((SUCCEEDED(hr = std::get<I>(arguments).Load(args[I])) || (bad = I, false)) && ...);
    if (FAILED(hr))
        return {hr, false, bad};
    if constexpr (S::hasResult) {
        Result<typename S::ResultType> out;
        hr = (object->*Fn)(std::get<I>(arguments).Get()..., out.Address());
        if (SUCCEEDED(hr) && result != nullptr)
            out.Store(result);
    } else {
        hr = (object->*Fn)(std::get<I>(arguments).Get()...);
    }
    return {hr, true, 0};
}

template <auto Fn> InvokeOutcome Invoke(void* self, VARIANT* args, VARIANT* result) {
    return Call<Fn>(self, args, result, std::make_index_sequence<Signature<decltype(Fn)>::inputs>());
}

template <auto Fn> constexpr MemberDescription Describe(const char* name, MemberKind kind) {
    using S = Signature<decltype(Fn)>;
    ParamType result{VT_EMPTY, nullptr};
    if constexpr (S::hasResult)
        result = TypeOf<typename S::ResultType>();
    return {name, kind, kInputTypes<Fn>, result, &Invoke<Fn>};
}

template <class Base> constexpr auto BaseDescriptionOf() -> const InterfaceDescription* (*)() {
    if constexpr (requires { Base::Description(); })
        return [] { return &Base::Description(); };
    else
        return nullptr;
}

} // namespace dispatch_detail

#define BW_DECLARE_PROP(Type, Name)                                                                          \
    virtual HRESULT get_##Name(Type* value) = 0;                                                             \
    virtual HRESULT put_##Name(Type value) = 0;
#define BW_DECLARE_GET(Type, Name) virtual HRESULT get_##Name(Type* value) = 0;
#define BW_DECLARE_PUT(Type, Name) virtual HRESULT put_##Name(Type value) = 0;
#define BW_DECLARE_METHOD(Name, Params) virtual HRESULT Name Params = 0;
#define BW_DECLARE_MEMBER(kind, ...) BW_DECLARE_##kind(__VA_ARGS__)

#define BW_DESCRIBE_PROP(Type, Name)                                                                                \
    ::dispatch_detail::Describe<&Me::get_##Name>(#Name, MemberKind::PropertyGet),                                    \
        ::dispatch_detail::Describe<&Me::put_##Name>(#Name, MemberKind::PropertyPut),
#define BW_DESCRIBE_GET(Type, Name) ::dispatch_detail::Describe<&Me::get_##Name>(#Name, MemberKind::PropertyGet),
#define BW_DESCRIBE_PUT(Type, Name) ::dispatch_detail::Describe<&Me::put_##Name>(#Name, MemberKind::PropertyPut),
#define BW_DESCRIBE_METHOD(Name, Params) ::dispatch_detail::Describe<&Me::Name>(#Name, MemberKind::Method),
#define BW_DESCRIBE_MEMBER(kind, ...) BW_DESCRIBE_##kind(__VA_ARGS__)

// Declares interface Name on Base with the identifier IID_Name and the members of the list macro.
// An interface on IDispatch is dual: it answers automation calls by name through IDispatchImpl.
// The description is built on first use (a template), so interfaces may name each other in their
// parameters before all of them are complete.
#define BW_INTERFACE(Name, Base, MEMBERS)                                                                          \
    struct Name : Base {                                                                                             \
        using BaseInterface = Base;                                                                                  \
        static constexpr IID iid = IID_##Name;                                                                       \
        MEMBERS(BW_DECLARE_MEMBER)                                                                                   \
        template <class Me = Name>                                                                                   \
        static const InterfaceDescription& Description() {                                                          \
            static constexpr MemberDescription members[] = {MEMBERS(BW_DESCRIBE_MEMBER) MemberDescription{}};        \
            static constexpr InterfaceDescription description{                                                      \
                #Name, &Me::iid, ::dispatch_detail::BaseDescriptionOf<Base>(),                                       \
                std::span<const MemberDescription>(members, std::size(members) - 1)};                                \
            return description;                                                                                      \
        }                                                                                                            \
                                                                                                                     \
    protected:                                                                                                       \
        ~Name() = default;                                                                                           \
    }

// An object's interface map: the interfaces it lists, each answering for its whole base chain.
//
//     using Interfaces = InterfaceMap<IPatternLine, IExclusionAwarePattern, ICloneablePattern,
//                                     ISupportErrorInfo>;
//
// answers IPatternLine, IPatternShape, IPattern, IDispatch, the other three and IUnknown. An identifier
// is served by the first listed interface whose chain contains it, and IUnknown always through the
// first entry, so every query for IUnknown returns the same pointer (the object's identity).
#pragma once

#include "platform/unknown.h"

template <class First, class... Rest> struct InterfaceMap {
    template <class T> static IUnknown* Identity(T* object) {
        return static_cast<IUnknown*>(static_cast<First*>(object));
    }

    // Finds the interface without adding a reference; null when the object does not answer it.
    template <class T> static void* Find(T* object, REFIID riid) {
        if (riid == IUnknown::iid)
            return Identity(object);
        return FindIn<T, First, Rest...>(object, riid);
    }

  private:
    template <class T, class I, class... More> static void* FindIn(T* object, REFIID riid) {
        if (ImplementsInterface<I>(riid))
            return CastThroughChain<I>(static_cast<I*>(object), riid);
        if constexpr (sizeof...(More) > 0)
            return FindIn<T, More...>(object, riid);
        else
            return nullptr;
    }

    // The pointer for riid inside I's chain: walk down the bases until the identifiers match.
    template <class I> static void* CastThroughChain(I* pointer, REFIID riid) {
        if (riid == I::iid)
            return pointer;
        if constexpr (HasBaseInterface<I>) {
            using Base = typename I::BaseInterface;
            return CastThroughChain<Base>(static_cast<Base*>(pointer), riid);
        } else {
            return nullptr;
        }
    }
};

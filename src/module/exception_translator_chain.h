// A chain of exception translators ending in the tail that rethrows.
//
// Links are appended at the inner end, next to the tail, so the link appended last is tried first:
// append the general types before the specific ones derived from them.
#pragma once

#include "module/exception_translator.h"
#include "module/exception_translator_tail.h"

#include <memory>
#include <utility>

namespace Norvane {

class ExceptionTranslatorChain {
  public:
    ExceptionTranslatorChain() : head_(std::make_unique<ExceptionTranslatorTail>()) {}

    // Adds a link for exceptions of type E, translated by translate (called with a const E&).
    template <class E, class F> void Append(F translate) {
        std::unique_ptr<ExceptionTranslatorBase>& innerEnd = InnerEnd();
        auto link = std::make_unique<ExceptionTranslator<E, F>>(std::move(innerEnd), std::move(translate));
        innermostNext_ = &link->Next();
        innerEnd = std::move(link);
    }

    // Call only while an exception is being handled: its translation, or the exception itself rethrown
    // when no link knows its type.
    HResultException TranslateCurrent() const { return head_->Translate(); }

  private:
    // The slot that holds the tail.
    std::unique_ptr<ExceptionTranslatorBase>& InnerEnd() { return innermostNext_ ? *innermostNext_ : head_; }

    std::unique_ptr<ExceptionTranslatorBase> head_;
    // The next slot of the innermost link, null while the chain is only the tail. It lives inside a
    // heap-allocated link, so moving the chain keeps it valid.
    std::unique_ptr<ExceptionTranslatorBase>* innermostNext_ = nullptr;
};

} // namespace Norvane

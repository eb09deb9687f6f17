// A link of the translator chain for one exception type: the links behind it get the first chance,
// and whatever of type E comes back out of them is translated by F.
#pragma once

#include "module/exception_translator_base.h"

#include <memory>
#include <utility>

namespace Norvane {

// F is called with a const E& and returns the HResultException for it.
template <class E, class F> class ExceptionTranslator final : public ExceptionTranslatorBase {
  public:
    ExceptionTranslator(std::unique_ptr<ExceptionTranslatorBase> next, F translate)
        : next_(std::move(next)), translate_(std::move(translate)) {}

    HResultException Translate() const override {
        try {
            return next_->Translate();
        } catch (const E& e) {
            return translate_(e);
        }
    }

    // The slot of the link behind this one, where the chain inserts links tried before it.
    std::unique_ptr<ExceptionTranslatorBase>& Next() { return next_; }

  private:
    std::unique_ptr<ExceptionTranslatorBase> next_;
    F translate_;
};

} // namespace Norvane

// The innermost link of the translator chain: rethrows the exception in flight, so that each link in
// front of it sees the exception inside its own handler.
#pragma once

#include "module/exception_translator_base.h"

namespace Norvane {

class ExceptionTranslatorTail final : public ExceptionTranslatorBase {
  public:
    [[noreturn]] HResultException Translate() const override;
};

} // namespace Norvane

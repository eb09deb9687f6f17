// One link of the chain that turns the exception in flight into an HResultException.
#pragma once

#include "module/hresult_exception.h"

namespace Norvane {

class ExceptionTranslatorBase {
  public:
    virtual ~ExceptionTranslatorBase() = default;
    ExceptionTranslatorBase(const ExceptionTranslatorBase&) = delete;
    ExceptionTranslatorBase& operator=(const ExceptionTranslatorBase&) = delete;

    // Call only while an exception is being handled. Returns the translation of that exception by
    // this link or one behind it; an exception no link knows leaves unchanged.
    virtual HResultException Translate() const = 0;

  protected:
    ExceptionTranslatorBase() = default;
};

} // namespace Norvane

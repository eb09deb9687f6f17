#include "module/exception_translator_tail.h"

namespace Norvane {

HResultException ExceptionTranslatorTail::Translate() const {
    throw;
}

} // namespace Norvane

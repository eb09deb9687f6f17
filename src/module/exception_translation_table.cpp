#include "module/exception_translation_table.h"

#include "module/error_info_fields.h"
#include "module/win32_error.h"
#include "platform/com_error.h"

#include <new>
#include <stdexcept>
#include <typeinfo>
#include <utility>

namespace Norvane {

namespace {

template <HRESULT Code> HResultException WithMessage(const std::exception& e) {
    return HResultException(Code, e.what());
}

HResultException FromComError(const ComError& e) {
    ErrorInfoFields fields = ReadErrorInfoFields(e.ErrorInfo());
    return HResultException(e.Error(), std::move(fields.source), std::move(fields.description),
                            std::move(fields.helpFile), fields.helpContext);
}

HResultException Unchanged(const HResultException& e) {
    return e;
}

// HRESULTs travel as 32-bit values; a thrown long (64 bits on this platform) keeps its low 32 bits.
HResultException FromThrownLong(const long& value) {
    return HResultException(static_cast<HRESULT>(value));
}

HResultException FromThrownInt(const int& value) {
    return HResultException(static_cast<HRESULT>(value));
}

HResultException FromWin32Error(const win32_error& e) {
    return HResultException(HResultFromWin32(e.Code()), e.what());
}

// Appended from the most general type to the most specific, so the most specific is tried first.
ExceptionTranslatorChain BuildStandardChain() {
    ExceptionTranslatorChain chain;
    chain.Append<std::exception>(WithMessage<E_FAIL>);
    chain.Append<std::bad_cast>(WithMessage<E_INVALIDARG>);
    chain.Append<std::invalid_argument>(WithMessage<E_INVALIDARG>);
    chain.Append<std::out_of_range>(WithMessage<E_INVALIDARG>);
    chain.Append<std::bad_alloc>(WithMessage<E_OUTOFMEMORY>);
    chain.Append<ComError>(FromComError);
    chain.Append<HResultException>(Unchanged);
    chain.Append<long>(FromThrownLong);
    chain.Append<int>(FromThrownInt);
    chain.Append<win32_error>(FromWin32Error);
    return chain;
}

} // namespace

const ExceptionTranslatorChain& StandardExceptionTranslators() {
    // A function-local static: the language runs its construction once, and threads arriving during
    // the construction wait for it to finish.
    static const ExceptionTranslatorChain chain = BuildStandardChain();
    return chain;
}

} // namespace Norvane

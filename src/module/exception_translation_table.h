// The library's translator chain: which exception becomes which HResultException at the boundary.
#pragma once

#include "module/exception_translator_chain.h"

namespace Norvane {

// Built by the first call in the process and kept until the module unloads. Concurrent first calls
// are safe: one thread builds the chain while the others wait for it. Read-only once built.
//
// Tried in this order (most specific first):
//   win32_error                      code <= 0: the code itself, else 0x8007xxxx; message = what
//   thrown long or int               that value as HRESULT, no text
//   HResultException                 unchanged
//   ComError                         its HRESULT, with the fields of its error information if it has one
//   std::bad_alloc                   E_OUTOFMEMORY, message = what
//   std::out_of_range                E_INVALIDARG, message = what
//   std::invalid_argument            E_INVALIDARG, message = what
//   std::bad_cast                    E_INVALIDARG, message = what
//   std::exception                   E_FAIL, message = what
// Anything else leaves the chain as it came.
const ExceptionTranslatorChain& StandardExceptionTranslators();

} // namespace Norvane

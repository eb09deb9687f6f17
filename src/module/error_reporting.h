// Translation of exceptions into HRESULTs with error information, and back again for failed calls.
#pragma once

#include "module/hresult_exception.h"
#include "platform/guid.h"

#include <string>

namespace Norvane {

// The boundary routine: call it only from a catch-all handler. Translates the exception in flight
// through the translator chain, publishes error information for the thread (GUID riid, then source,
// description, help file and help context of the translation) and returns the HRESULT. Types the chain
// does not know, a failure of the chain itself, or a call outside any handler give E_UNEXPECTED without
// text. A translation with a success code is returned as E_FAIL, since an exception never reports
// success. When building or installing the error information fails, the thread's error information
// stays as it was. Never throws.
HRESULT TranslateCurrentException(REFIID riid);

// Call check: for a failed hr, throws HResultException with the thread's error information (its
// source, description, help file and help context; empty when the thread has none), taking the
// information out of the thread's slot. Success codes pass through and are returned.
HRESULT CheckResult(HRESULT hr);

// As above; a non-empty description given by the caller (widened byte by byte) takes precedence over
// the description of the error information.
HRESULT CheckResult(HRESULT hr, const std::string& description);

} // namespace Norvane

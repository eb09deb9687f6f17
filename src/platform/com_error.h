// The platform's exception for a failed call: an HRESULT and, when the callee left one, its
// error information.
#pragma once

#include "platform/com_ptr.h"
#include "platform/error_info.h"

class ComError {
  public:
    explicit ComError(HRESULT hr, CComPtr<IErrorInfo> info = {}) : hr_(hr), info_(std::move(info)) {}

    HRESULT Error() const { return hr_; }
    IErrorInfo* ErrorInfo() const { return info_; }

  private:
    HRESULT hr_;
    CComPtr<IErrorInfo> info_;
};

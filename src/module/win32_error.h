// The exception that carries a Win32 error code. The library never raises it itself; the boundary
// translation covers it so that code raising it reports a proper HRESULT.
#pragma once

#include "platform/com_types.h"

#include <stdexcept>
#include <string>

namespace Norvane {

class win32_error : public std::runtime_error {
  public:
    win32_error(LONG code, const std::string& message);

    LONG Code() const { return code_; }

  private:
    LONG code_;
};

// The HRESULT of a Win32 error code: codes of zero and below are taken as they are (they already are
// HRESULTs or success), positive codes keep their low 16 bits under the Win32 facility, 0x8007xxxx.
HRESULT HResultFromWin32(LONG code);

} // namespace Norvane

// The exception that carries an HRESULT and a message through the library to the interface boundary.
#pragma once

#include "platform/com_types.h"

#include <stdexcept>
#include <string>

namespace Norvane {

// Fields: the error code, then source, description, help file and help context as error information
// carries them. Source, help file and help context are set only when taken from a callee's error
// information. The text of `what` is composed once, when the exception is built, so reading it never
// allocates and concurrent readers of one exception object see the same text.
class HResultException : public std::runtime_error {
  public:
    explicit HResultException(HRESULT hr);
    // The description is the message with every 8-bit character widened unchanged.
    HResultException(HRESULT hr, const std::string& message);
    HResultException(HRESULT hr, std::u16string source, std::u16string description, std::u16string helpFile,
                     DWORD helpContext);

    HRESULT Error() const { return hr_; }
    const std::u16string& Source() const { return source_; }
    const std::u16string& Description() const { return description_; }
    const std::u16string& HelpFile() const { return helpFile_; }
    DWORD HelpContext() const { return helpContext_; }

    // "HRESULT 80070057: The parameter is incorrect.: <description>" and "\nSource: <source>" when set;
    // the system text appears only for codes that have one, description and source only when not empty.
    // Description and source appear through the low 8 bits of each character.
    const char* what() const noexcept override;

  private:
    static std::string ComposeText(HRESULT hr, const std::u16string& source,
                                   const std::u16string& description);

    HRESULT hr_;
    std::u16string source_;
    std::u16string description_;
    std::u16string helpFile_;
    DWORD helpContext_ = 0;
};

} // namespace Norvane

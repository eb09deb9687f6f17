// The text fields of an error-information object, read into plain values.
#pragma once

#include "platform/error_info.h"

#include <string>

namespace Norvane {

struct ErrorInfoFields {
    std::u16string source;
    std::u16string description;
    std::u16string helpFile;
    DWORD helpContext = 0;
};

// Reads source, description, help file and help context; a getter that fails leaves its field empty
// (or 0), so a partly readable object still passes on what it has. A null info gives empty fields.
ErrorInfoFields ReadErrorInfoFields(IErrorInfo* info);

// Takes the thread's error information (emptying the thread's slot) and reads its fields; empty
// fields when the thread has none.
ErrorInfoFields TakeThreadErrorInfoFields();

} // namespace Norvane

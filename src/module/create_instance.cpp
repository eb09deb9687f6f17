#include "module/create_instance.h"

#include "module/byte_text.h"

namespace Norvane {

std::u16string CreationFailureText(REFCLSID clsid) {
    return u"CoCreateInstance(" + WidenBytes(GuidToString(clsid)) + u")";
}

void ThrowCreationFailure(HRESULT hr, REFCLSID clsid) {
    std::u16string text = CreationFailureText(clsid);
    throw HResultException(hr, text, text, u"", 0);
}

} // namespace Norvane

#include "module/error_reporting.h"

#include "module/byte_text.h"
#include "module/error_info_fields.h"
#include "module/exception_translation_table.h"
#include "platform/error_info.h"

#include <exception>
#include <utility>

namespace Norvane {

namespace {

// Builds the error information and installs it for the thread; at the first failing step it stops,
// leaving the thread's error information as it was.
void PublishErrorInfo(REFIID riid, LPCOLESTR source, LPCOLESTR description, LPCOLESTR helpFile,
                      DWORD helpContext) noexcept {
    CComPtr<ICreateErrorInfo> creator;
    if (FAILED(CreateErrorInfo(&creator)))
        return;
    if (FAILED(creator->SetGUID(riid)) || FAILED(creator->SetSource(source)) ||
        FAILED(creator->SetDescription(description)) || FAILED(creator->SetHelpFile(helpFile)) ||
        FAILED(creator->SetHelpContext(helpContext)))
        return;
    CComPtr<IErrorInfo> info;
    if (FAILED(creator.QueryInterface(&info)))
        return;
    SetErrorInfo(0, info);
}

// A thrown exception always reports a failure. A translation that carries a success code (a
// win32_error with code 0, a thrown 0, an HResultException built with S_OK) would tell the caller that
// the method worked while its out values were never set, so such codes are reported as E_FAIL with the
// texts of the translation.
HRESULT Publish(REFIID riid, const HResultException& e) noexcept {
    PublishErrorInfo(riid, e.Source().c_str(), e.Description().c_str(), e.HelpFile().c_str(),
                     e.HelpContext());
    return FAILED(e.Error()) ? e.Error() : E_FAIL;
}

// Needs no allocation, so it works even when memory has run out.
HRESULT PublishUnexpected(REFIID riid) noexcept {
    PublishErrorInfo(riid, u"", u"", u"", 0);
    return E_UNEXPECTED;
}

} // namespace

HRESULT TranslateCurrentException(REFIID riid) {
    if (std::current_exception() == nullptr)
        return PublishUnexpected(riid);
    try {
        return Publish(riid, StandardExceptionTranslators().TranslateCurrent());
    } catch (...) {
        return PublishUnexpected(riid);
    }
}

HRESULT CheckResult(HRESULT hr) {
    return CheckResult(hr, std::string());
}

HRESULT CheckResult(HRESULT hr, const std::string& description) {
    if (SUCCEEDED(hr))
        return hr;
    ErrorInfoFields fields = TakeThreadErrorInfoFields();
    if (!description.empty())
        fields.description = WidenBytes(description);
    throw HResultException(hr, std::move(fields.source), std::move(fields.description),
                           std::move(fields.helpFile), fields.helpContext);
}

} // namespace Norvane

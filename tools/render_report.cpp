#include "tools/render_report.h"

#include "tools/library_call.h"
#include "tools/scan_readout.h"

#include <chrono>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

void ReadValidation(IPattern& pattern, RenderReport& report) {
    CComPtr<IPatternValidationResult> result;
    CheckCall(pattern.Validate(&result), "Validate");
    VARIANT_BOOL valid = VARIANT_FALSE;
    CheckCall(result->get_Valid(&valid), "Validate.Valid");
    CComBSTR description;
    CheckCall(result->get_Description(&description), "Validate.Description");
    report.valid = valid != VARIANT_FALSE;
    report.description = description.Utf8();
}

std::optional<DacRectangle> ReadDacBoundingBox(IPattern& pattern) {
    CComPtr<IRectangleInt> box;
    const HRESULT hr = pattern.GetDacBoundingBox(&box);
    if (hr == E_NOTIMPL)
        return std::nullopt;
    CheckCall(hr, "GetDacBoundingBox");
    return ReadRectangle(*box, "GetDacBoundingBox");
}

void Render(IPattern& pattern, RenderReport& report) {
    CComPtr<IScanDefinition> scanDefinition;
    const auto start = std::chrono::steady_clock::now();
    CheckCall(pattern.Render(&scanDefinition), "Render");
    const std::chrono::duration<double> elapsed = std::chrono::steady_clock::now() - start;
    report.renderSeconds = elapsed.count();
    report.scan = ReadScanDefinition(*scanDefinition);
}

} // namespace

RenderReport BuildRenderReport(IPattern& pattern, const std::string& className) {
    RenderReport report{};
    report.className = className;
    ReadValidation(pattern, report);
    CheckCall(pattern.GetDwellTimeResolution(&report.dwellTimeResolution), "GetDwellTimeResolution");
    report.dacBoundingBox = ReadDacBoundingBox(pattern);
    if (!report.valid)
        return report;
    double loopTime = 0.0;
    CheckCall(pattern.GetLoopTime(&loopTime), "GetLoopTime");
    report.loopTime = loopTime;
    Render(pattern, report);
    return report;
}

} // namespace Norvane::Lumis::Scanning::Tool

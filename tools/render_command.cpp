#include "tools/render_command.h"

#include "tools/atomic_file.h"
#include "tools/builtin_example.h"
#include "tools/dose_preview.h"
#include "tools/job_file.h"
#include "tools/png_encoder.h"
#include "tools/point_export.h"
#include "tools/render_report.h"
#include "tools/report_output.h"
#include "tools/tool_error.h"

#include <memory>
#include <ostream>
#include <vector>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

Json LoadJob(const RenderOptions& options) {
    return options.jobPath ? ReadJobFile(*options.jobPath)
                           : ParseJob(BuiltinExampleJob(), kBuiltinExampleName);
}

CComPtr<IPattern> PatternOf(const JobObject& object) {
    CComPtr<IPattern> pattern = QueryAs<IPattern>(object.object.Get());
    if (!pattern)
        throw ToolError("class: " + object.className + " is not a pattern");
    return pattern;
}

void WriteReport(const RenderReport& report, bool json, std::ostream& out) {
    if (json)
        out << ReportJson(report).dump(2) << '\n';
    else
        WriteSummary(report, out);
}

// Every requested file is written in full under a temporary name first; only when all of them are
// complete are they moved into place.
void WriteOutputFiles(const RenderedScan& scan, const RenderOptions& options) {
    std::vector<std::unique_ptr<PendingFile>> files;
    const auto pending = [&files](const std::string& path, const char* option) -> std::ostream& {
        return files.emplace_back(std::make_unique<PendingFile>(path, option))->Stream();
    };
    if (options.pointsPath)
        WritePointsCsv(scan, pending(*options.pointsPath, "--points"));
    if (options.streamPath)
        WriteStreamFile(scan, pending(*options.streamPath, "--stream"));
    if (options.previewPath) {
        const std::string png = EncodePng(RenderDosePreview(scan, kPreviewMaxSide));
        pending(*options.previewPath, "--preview")
            .write(png.data(), static_cast<std::streamsize>(png.size()));
    }
    for (const auto& file : files)
        file->Close();
    for (const auto& file : files)
        file->Commit();
}

int Render(const RenderOptions& options, std::ostream& out, std::ostream& err) {
    const JobObject object = ApplyJob(LoadJob(options));
    const CComPtr<IPattern> pattern = PatternOf(object);
    const RenderReport report = BuildRenderReport(*pattern, object.className);
    if (!report.valid) {
        WriteReport(report, options.json, out);
        err << "invalid pattern: " << TrimmedDescription(report.description) << '\n';
        return kExitInvalidPattern;
    }
    WriteOutputFiles(*report.scan, options);
    WriteReport(report, options.json, out);
    return kExitSuccess;
}

} // namespace

int RunRender(const RenderOptions& options, std::ostream& out, std::ostream& err) {
    try {
        return Render(options, out, err);
    } catch (const ToolError& error) {
        err << error.what() << '\n';
    } catch (const std::exception& error) {
        err << "beamweaver: " << error.what() << '\n';
    }
    return kExitBadInput;
}

} // namespace Norvane::Lumis::Scanning::Tool

// `beamweaver render`: applies a job, renders the pattern, reports and writes the requested files.
#pragma once

#include <iosfwd>
#include <optional>
#include <string>

namespace Norvane::Lumis::Scanning::Tool {

inline constexpr int kExitSuccess = 0;
inline constexpr int kExitInvalidPattern = 1;
inline constexpr int kExitBadInput = 2;

// The longer side of the preview picture, in pixels.
inline constexpr int kPreviewMaxSide = 1024;

struct RenderOptions {
    std::optional<std::string> jobPath; // the built-in example job when absent
    bool json = false;
    std::optional<std::string> pointsPath;
    std::optional<std::string> streamPath;
    std::optional<std::string> previewPath;
};

// Runs the command with the library's classes registered. Returns kExitSuccess after the report;
// kExitInvalidPattern after the report of a pattern that is not valid (one line with the validation
// description on err); kExitBadInput with one line on err for a job, a value or an output the run could
// not use. Output files are written only by a successful run.
int RunRender(const RenderOptions& options, std::ostream& out, std::ostream& err);

} // namespace Norvane::Lumis::Scanning::Tool

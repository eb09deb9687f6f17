// The program's command line: `beamweaver render [JOB] [options]`, with help that explains the job
// format, the outputs and the exit status.
#pragma once

#include "tools/render_command.h"

#include <iosfwd>
#include <optional>

namespace Norvane::Lumis::Scanning::Tool {

struct CommandLine {
    std::optional<RenderOptions> render; // absent when the parser already answered (help, a usage error)
    int exitCode;                        // what to exit with when render is absent
};

// "beamweaver --help" and "beamweaver render --help" print help to out; usage errors print one line to
// err and exit with kExitBadInput.
CommandLine ParseCommandLine(int argc, const char* const* argv, std::ostream& out, std::ostream& err);

} // namespace Norvane::Lumis::Scanning::Tool

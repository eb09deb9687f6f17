// The job rendered when no job file is given, so a first run shows something real.
#pragma once

#include <string_view>

namespace Norvane::Lumis::Scanning::Tool {

// How messages name the built-in job.
inline constexpr const char* kBuiltinExampleName = "built-in example";

// A line across the field whose dwell time rises twentyfold from begin to end, with pre- and
// post-blanking; the same job as examples/line_dwell_ramp.json.
std::string_view BuiltinExampleJob();

} // namespace Norvane::Lumis::Scanning::Tool

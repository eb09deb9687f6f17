// The report as people read it (a short summary) and as programs read it (one JSON object).
#pragma once

#include "tools/job_json.h"
#include "tools/render_report.h"

#include <iosfwd>
#include <string>

namespace Norvane::Lumis::Scanning::Tool {

// The shortest text that reads back as the same double: "2.5e-08", "0.0055".
std::string FormatNumber(double value);

// One "name  value" line per item: class, validity with the description, points, sub patterns, dwell
// time resolution, loop time, gate-pulse idle ticks, acquisition update points, DAC bounding box,
// render time. Items an invalid pattern cannot give read "n/a".
void WriteSummary(const RenderReport& report, std::ostream& out);

// Exactly the keys class, valid, description, point_count, sub_pattern_count, dwell_time_resolution,
// loop_time, gate_pulse_idle_ticks, acquisition_update_points, dac_bounding_box ([left, top, right,
// bottom] or null), render_seconds; values that cannot be computed are null.
Json ReportJson(const RenderReport& report);

// The description without the trailing blank the validation messages end with.
std::string TrimmedDescription(const std::string& description);

} // namespace Norvane::Lumis::Scanning::Tool

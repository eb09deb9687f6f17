#include "tools/command_line.h"

#include <ostream>
#include <stdexcept>
#include <string>
#include <string_view>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

constexpr const char* kProgramHelp = R"help(Renders beam scan patterns described in JSON job files.

Usage: beamweaver render [JOB] [--json] [--points FILE.csv] [--stream FILE.str] [--preview FILE.png]

Run 'beamweaver render --help' for the job file format, the outputs and the exit status.
)help";

constexpr const char* kRenderUsage = R"help(Usage: beamweaver render [JOB] [options]

Renders one pattern described in a JSON job file and reports what it produced.

Arguments:
  JOB                 JSON job file (default: the built-in example job)
Options:
  --json              print the report as one JSON object instead of the summary
  --points FILE.csv   write every rendered point as CSV
  --stream FILE.str   write the rendering as a stream file
  --preview FILE.png  write a dose picture of the field of view
  -h, --help          show this help
)help";

constexpr const char* kRenderHelp = R"help(
Job file: one JSON object describing one object of the library.
  "class"        a class name or its ProgID, e.g. "PatternLine" or "Beamweaver.PatternLine"
  any other key  a property or method name of that object (case does not matter), applied in file
                 order through the object's automation interface
Values: numbers, booleans and strings as they are. Geometry values as arrays of their fields:
  coordinate [x, y], float rectangle [left, top, right, bottom], integer range [min, max],
  size [width, height], matrix [m0, m1, m2, m3, m4, m5].
  Object values (rendering properties, alignments, ...) as nested job objects, whose "class" may be
  left out where the property's type fixes it: the property's current value is read, the nested keys are
  set on it in file order and it is put back. null passes no object.
  A method that takes one argument takes an array and is called once per element.
Example:
  { "class": "PatternLine", "Begin": [0.1, 0.2], "End": [0.8, 0.9], "Pitch": 0.05,
    "BeginDwellTime": 1e-6, "EndDwellTime": 2e-6, "MultiPass": 1,
    "RenderingProperties": { "PreBlankingTime": 2e-6,
      "PatternAlignmentsX": { "Range": [0, 65535], "SlewRate": 1.5e11 } } }
Without JOB the built-in example (examples/line_dwell_ramp.json) is rendered.

Output: a summary on standard output: class, valid or not with the description, points (sum over
sub patterns), sub patterns, dwell time resolution, loop time, gate-pulse idle ticks, acquisition update
points, DAC bounding box, render time. With --json instead one JSON object with the keys class, valid,
description, point_count, sub_pattern_count, dwell_time_resolution, loop_time, gate_pulse_idle_ticks,
acquisition_update_points, dac_bounding_box ([left, top, right, bottom] or null), render_seconds.
  --points    CSV "sub,repeat,x,y,dwell,flags": every point, sub pattern by sub pattern, x and y
              including the sub pattern's offsets, flags as a decimal number.
  --stream    stream file: "s16,<N>ns,dac" (N = dwell time resolution in nanoseconds, which must be
              whole), repeat line 1, the point count, then "dwell x y beam_on" per point played, each
              sub pattern repeated by its repeat count; beam_on 0 for blanked points.
  --preview   PNG of the field of view (at most 1024 pixels on the longer side) showing the exposure
              dose, dwell x repeat of the unblanked points in each pixel, on the viridis colour map
              with a logarithmic scale; black where nothing is exposed.
Output files are written only when the run succeeds; a failed run leaves none behind.

Exit status:
  0  success
  1  the pattern is not valid: the summary is printed, with the validation description
  2  bad input: an unreadable or malformed job, an unknown class or property, a value of the wrong
     type or one the library refuses, or an output that cannot be written. One line on standard
     error names the JSON path and the reason, with the library's text and HRESULT where there is
     one, e.g. "Pitch: value refused (0x80070057)".)help";

// "--points FILE" or "--points=FILE" for the option name; true when the argument was this option. Usage
// errors throw std::invalid_argument.
bool TakeFileOption(std::string_view name, int argc, const char* const* argv, int& index,
                    std::optional<std::string>& value) {
    const std::string_view argument = argv[index];
    if (argument != name && argument.rfind(std::string(name) + "=", 0) != 0)
        return false;
    if (value)
        throw std::invalid_argument(std::string(name) + " is given twice");
    if (argument.size() > name.size()) {
        value = std::string(argument.substr(name.size() + 1));
    } else if (index + 1 < argc) {
        value = argv[++index];
    }
    if (!value || value->empty())
        throw std::invalid_argument(std::string(name) + " needs a file name");
    return true;
}

bool IsHelp(std::string_view argument) {
    return argument == "--help" || argument == "-h";
}

// Parses the arguments after "render"; help was handled before.
RenderOptions ParseRenderArguments(int argc, const char* const* argv) {
    RenderOptions options;
    for (int i = 2; i < argc; ++i) {
        const std::string_view argument = argv[i];
        if (argument == "--json") {
            options.json = true;
        } else if (TakeFileOption("--points", argc, argv, i, options.pointsPath) ||
                   TakeFileOption("--stream", argc, argv, i, options.streamPath) ||
                   TakeFileOption("--preview", argc, argv, i, options.previewPath)) {
            continue;
        } else if (argument.size() > 1 && argument.front() == '-') {
            throw std::invalid_argument("unknown option " + std::string(argument));
        } else if (options.jobPath) {
            throw std::invalid_argument("more than one job file: " + *options.jobPath + " and " +
                                        std::string(argument));
        } else {
            options.jobPath = std::string(argument);
        }
    }
    return options;
}

bool AsksForHelp(int argc, const char* const* argv, int first) {
    for (int i = first; i < argc; ++i)
        if (IsHelp(argv[i]))
            return true;
    return false;
}

} // namespace

CommandLine ParseCommandLine(int argc, const char* const* argv, std::ostream& out, std::ostream& err) {
    if (argc >= 2 && IsHelp(argv[1])) {
        out << kProgramHelp;
        return {std::nullopt, kExitSuccess};
    }
    if (argc < 2 || std::string_view(argv[1]) != "render") {
        err << "beamweaver: expected the command 'render' (see beamweaver --help)\n";
        return {std::nullopt, kExitBadInput};
    }
    if (AsksForHelp(argc, argv, 2)) {
        out << kRenderUsage << kRenderHelp << '\n';
        return {std::nullopt, kExitSuccess};
    }
    try {
        return {ParseRenderArguments(argc, argv), kExitSuccess};
    } catch (const std::invalid_argument& usage) {
        err << "beamweaver render: " << usage.what() << " (see beamweaver render --help)\n";
        return {std::nullopt, kExitBadInput};
    }
}

} // namespace Norvane::Lumis::Scanning::Tool

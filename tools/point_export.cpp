#include "tools/point_export.h"

#include "tools/report_output.h"
#include "tools/tool_error.h"

#include <cmath>
#include <limits>
#include <ostream>
#include <string>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

// Resolutions are products of decimal values (2.5e-8 s), so the nanosecond count carries rounding noise
// in the last bits; anything further from a whole number than that is not whole.
constexpr double kWholeTolerance = 1e-6;

std::uint64_t StreamPointCount(const RenderedScan& scan) {
    std::uint64_t count = 0;
    for (const RenderedSubPattern& subPattern : scan.subPatterns)
        count += std::uint64_t{subPattern.repeatCount} * subPattern.points.size();
    return count;
}

void CheckDacPosition(std::uint32_t position, std::size_t sub, const char* axis) {
    if (position > std::numeric_limits<std::uint16_t>::max())
        throw ToolError("--stream: sub pattern " + std::to_string(sub) + " places a point at " + axis +
                        " = " + std::to_string(position) + ", beyond the 16-bit DAC range");
}

// Checks every point of the sub pattern once before its repeats are written.
void CheckStreamable(const RenderedSubPattern& subPattern, std::size_t sub) {
    for (const PatternPoint& point : subPattern.points) {
        CheckDacPosition(std::uint32_t{point.x} + subPattern.offsetX, sub, "x");
        CheckDacPosition(std::uint32_t{point.y} + subPattern.offsetY, sub, "y");
        if (point.dwell == 0)
            throw ToolError("--stream: sub pattern " + std::to_string(sub) +
                            " has a point with dwell 0, which a stream file cannot hold");
    }
}

void WriteStreamPoints(const RenderedSubPattern& subPattern, std::ostream& out) {
    for (std::uint32_t repeat = 0; repeat < subPattern.repeatCount; ++repeat)
        for (const PatternPoint& point : subPattern.points)
            out << point.dwell << ' ' << (point.x + subPattern.offsetX) << ' '
                << (point.y + subPattern.offsetY) << ' ' << ((point.flags & PointFlag_Blank) ? 0 : 1) << '\n';
}

} // namespace

void WritePointsCsv(const RenderedScan& scan, std::ostream& out) {
    out << "sub,repeat,x,y,dwell,flags\n";
    for (std::size_t sub = 0; sub < scan.subPatterns.size(); ++sub) {
        const RenderedSubPattern& subPattern = scan.subPatterns[sub];
        for (const PatternPoint& point : subPattern.points)
            out << sub << ',' << subPattern.repeatCount << ',' << (point.x + subPattern.offsetX) << ','
                << (point.y + subPattern.offsetY) << ',' << point.dwell << ',' << unsigned{point.flags}
                << '\n';
    }
}

std::uint32_t WholeNanoseconds(double seconds) {
    const double nanoseconds = seconds * 1e9;
    const double whole = std::round(nanoseconds);
    if (!(whole >= 1.0) || whole > std::numeric_limits<std::uint32_t>::max() ||
        std::abs(nanoseconds - whole) > kWholeTolerance * whole)
        throw ToolError("--stream: the dwell time resolution " + FormatNumber(seconds) +
                        " s is not a whole number of nanoseconds, which a stream file requires");
    return static_cast<std::uint32_t>(whole);
}

void WriteStreamFile(const RenderedScan& scan, std::ostream& out) {
    const std::uint32_t nanoseconds = WholeNanoseconds(scan.dwellTimeResolution);
    for (std::size_t sub = 0; sub < scan.subPatterns.size(); ++sub)
        CheckStreamable(scan.subPatterns[sub], sub);
    out << "s16," << nanoseconds << "ns,dac\n1\n" << StreamPointCount(scan) << '\n';
    for (const RenderedSubPattern& subPattern : scan.subPatterns)
        WriteStreamPoints(subPattern, out);
}

} // namespace Norvane::Lumis::Scanning::Tool

#include "tools/report_output.h"

#include <charconv>
#include <cstdio>
#include <ostream>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

constexpr const char* kNotAvailable = "n/a";

void Line(std::ostream& out, const char* name, const std::string& value) {
    char label[32];
    std::snprintf(label, sizeof label, "%-27s", name);
    out << label << value << '\n';
}

std::string Seconds(double value) {
    return FormatNumber(value) + " s";
}

std::string Milliseconds(double seconds) {
    char text[32];
    std::snprintf(text, sizeof text, "%.3f ms", seconds * 1e3);
    return text;
}

std::string Rectangle(const DacRectangle& r) {
    return "[" + std::to_string(r.left) + ", " + std::to_string(r.top) + ", " + std::to_string(r.right) +
           ", " + std::to_string(r.bottom) + "]";
}

std::string Validity(const RenderReport& report) {
    const std::string description = TrimmedDescription(report.description);
    if (report.valid)
        return description.empty() ? "yes" : "yes (" + description + ")";
    return description.empty() ? "no" : "no: " + description;
}

template <class T, class F> std::string OrNotAvailable(const std::optional<T>& value, F format) {
    return value ? format(*value) : kNotAvailable;
}

template <class T, class F> Json OrNull(const std::optional<T>& value, F convert) {
    return value ? Json(convert(*value)) : Json(nullptr);
}

} // namespace

std::string FormatNumber(double value) {
    char text[64];
    const auto result = std::to_chars(text, text + sizeof text, value);
    return std::string(text, result.ptr);
}

std::string TrimmedDescription(const std::string& description) {
    const auto end = description.find_last_not_of(" \t\r\n");
    return end == std::string::npos ? std::string() : description.substr(0, end + 1);
}

void WriteSummary(const RenderReport& report, std::ostream& out) {
    const std::optional<RenderedScan>& scan = report.scan;
    Line(out, "class", report.className);
    Line(out, "valid", Validity(report));
    Line(out, "points",
         OrNotAvailable(scan, [](const RenderedScan& s) { return std::to_string(PointCount(s)); }));
    Line(out, "sub patterns",
         OrNotAvailable(scan, [](const RenderedScan& s) { return std::to_string(s.subPatterns.size()); }));
    Line(out, "dwell time resolution", Seconds(report.dwellTimeResolution));
    Line(out, "loop time", OrNotAvailable(report.loopTime, Seconds));
    Line(out, "gate-pulse idle ticks",
         OrNotAvailable(scan, [](const RenderedScan& s) { return std::to_string(s.gatePulseIdleTicks); }));
    Line(out, "acquisition update points", OrNotAvailable(scan, [](const RenderedScan& s) {
             return std::to_string(s.acquisitionUpdatePoints);
         }));
    Line(out, "DAC bounding box",
         report.dacBoundingBox ? Rectangle(*report.dacBoundingBox) : "not reported by this pattern");
    Line(out, "render time", OrNotAvailable(report.renderSeconds, Milliseconds));
}

Json ReportJson(const RenderReport& report) {
    const std::optional<RenderedScan>& scan = report.scan;
    Json json = Json::object();
    json["class"] = report.className;
    json["valid"] = report.valid;
    json["description"] = report.description;
    json["point_count"] = OrNull(scan, [](const RenderedScan& s) { return PointCount(s); });
    json["sub_pattern_count"] = OrNull(scan, [](const RenderedScan& s) { return s.subPatterns.size(); });
    json["dwell_time_resolution"] = report.dwellTimeResolution;
    json["loop_time"] = OrNull(report.loopTime, [](double t) { return t; });
    json["gate_pulse_idle_ticks"] = OrNull(scan, [](const RenderedScan& s) { return s.gatePulseIdleTicks; });
    json["acquisition_update_points"] =
        OrNull(scan, [](const RenderedScan& s) { return s.acquisitionUpdatePoints; });
    json["dac_bounding_box"] = OrNull(report.dacBoundingBox, [](const DacRectangle& r) {
        return std::vector<std::int32_t>{r.left, r.top, r.right, r.bottom};
    });
    json["render_seconds"] = OrNull(report.renderSeconds, [](double t) { return t; });
    return json;
}

} // namespace Norvane::Lumis::Scanning::Tool

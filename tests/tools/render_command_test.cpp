#include "tool_test_support.h"

#include "tools/builtin_example.h"
#include "tools/render_command.h"

#include <gtest/gtest.h>

#include <cmath>
#include <sstream>

namespace {

using namespace Norvane::Lumis::Scanning::Tool;
using ToolTest::Lines;
using ToolTest::ReadFile;
using ToolTest::SmallLineJob;
using ToolTest::TemporaryDirectory;

struct RunResult {
    int exitCode;
    std::string out;
    std::string err;
};

class RenderCommandTest : public ::testing::Test {
  protected:
    void SetUp() override { ToolTest::RegisterLibrary(); }

    RenderOptions WithJob(const Json& job) {
        ToolTest::WriteFile(directory / "job.json", job.dump());
        RenderOptions options;
        options.jobPath = (directory / "job.json").string();
        return options;
    }

    RenderOptions WithEveryOutput(const Json& job) {
        RenderOptions options = WithJob(job);
        options.pointsPath = (directory / "points.csv").string();
        options.streamPath = (directory / "scan.str").string();
        options.previewPath = (directory / "dose.png").string();
        return options;
    }

    static RunResult Render(const RenderOptions& options) {
        std::ostringstream out, err;
        const int exitCode = RunRender(options, out, err);
        return {exitCode, out.str(), err.str()};
    }

    TemporaryDirectory directory;
};

struct PngSize {
    std::uint32_t width;
    std::uint32_t height;
};

// Width and height from the IHDR chunk, which follows the 8-byte signature and the chunk's length and type.
PngSize PngSizeOf(const std::string& png) {
    const auto bigEndian = [&](std::size_t at) {
        std::uint32_t value = 0;
        for (std::size_t i = 0; i < 4; ++i)
            value = value << 8 | static_cast<unsigned char>(png.at(at + i));
        return value;
    };
    EXPECT_EQ(png.substr(1, 3), "PNG");
    EXPECT_EQ(png.substr(12, 4), "IHDR");
    return {bigEndian(16), bigEndian(20)};
}

TEST_F(RenderCommandTest, EveryOutputOfASmallLine) {
    Json job = SmallLineJob();
    job["RenderingProperties"] = Json::parse(R"({"PatternAlignmentsX": {"Range": [0, 65535]}})");
    const RunResult run = Render([&] {
        RenderOptions options = WithEveryOutput(job);
        options.json = true;
        return options;
    }());
    ASSERT_EQ(run.exitCode, kExitSuccess) << run.err;
    EXPECT_EQ(run.err, "");

    const Json report = Json::parse(run.out);
    std::vector<std::string> keys;
    for (const auto& item : report.items())
        keys.push_back(item.key());
    EXPECT_EQ(keys,
              (std::vector<std::string>{"class", "valid", "description", "point_count", "sub_pattern_count",
                                        "dwell_time_resolution", "loop_time", "gate_pulse_idle_ticks",
                                        "acquisition_update_points", "dac_bounding_box", "render_seconds"}));
    EXPECT_EQ(report["class"], "PatternLine");
    EXPECT_EQ(report["valid"], true);
    EXPECT_EQ(report["point_count"], 8)
        << "5 line points, one pre-blanking, one asymmetry, one post-blanking";
    EXPECT_EQ(report["sub_pattern_count"], 1);
    // Bounding box of (0.25, 0.5)-(0.75, 0.5): X over 0..65535 gives trunc(0.25 × 65535) = 16383 and
    // trunc(0.75 × 65535) = 49151; Y over the default 16384..49152 gives 16384 + 0.5 × 32768 = 32768.
    EXPECT_EQ(report["dac_bounding_box"], Json::parse("[16383, 32768, 49151, 32768]"));

    EXPECT_EQ(Lines(ReadFile(directory / "points.csv")).size(), 1u + 8u);

    const std::vector<std::string> stream = Lines(ReadFile(directory / "scan.str"));
    const auto nanoseconds = std::lround(report["dwell_time_resolution"].get<double>() * 1e9);
    ASSERT_EQ(stream.size(), 3u + 8u);
    EXPECT_EQ(stream[0], "s16," + std::to_string(nanoseconds) + "ns,dac");
    EXPECT_EQ(stream[1], "1");
    EXPECT_EQ(stream[2], "8");

    // 65536 × 32769 DAC positions: 1024 × 512 pixels.
    const PngSize png = PngSizeOf(ReadFile(directory / "dose.png"));
    EXPECT_EQ(png.width, 1024u);
    EXPECT_EQ(png.height, 512u);

    EXPECT_EQ(directory.Entries(),
              (std::vector<std::string>{"dose.png", "job.json", "points.csv", "scan.str"}));
}

TEST_F(RenderCommandTest, SummaryGivesEveryItemOnItsOwnLine) {
    const RunResult run = Render(WithJob(SmallLineJob()));
    ASSERT_EQ(run.exitCode, kExitSuccess) << run.err;
    const std::vector<std::string> lines = Lines(run.out);
    const std::vector<std::string> labels{"class",
                                          "valid",
                                          "points",
                                          "sub patterns",
                                          "dwell time resolution",
                                          "loop time",
                                          "gate-pulse idle ticks",
                                          "acquisition update points",
                                          "DAC bounding box",
                                          "render time"};
    ASSERT_EQ(lines.size(), labels.size());
    for (std::size_t i = 0; i < labels.size(); ++i)
        EXPECT_EQ(lines[i].rfind(labels[i], 0), 0u) << lines[i];
    EXPECT_EQ(lines[0], "class                      PatternLine");
    EXPECT_EQ(lines[1], "valid                      yes");
    EXPECT_EQ(lines[2], "points                     8");
}

TEST_F(RenderCommandTest, AnInvalidPatternIsReportedWithItsDescriptionAndExitsOneWithoutFiles) {
    Json job = SmallLineJob();
    job["BeginDwellTime"] = 1e-9; // below any dwell time resolution
    RenderOptions options = WithEveryOutput(job);
    const RunResult summary = Render(options);
    EXPECT_EQ(summary.exitCode, kExitInvalidPattern);
    EXPECT_EQ(Lines(summary.out).at(1), "valid                      no: BeginDwellTime out of range.");
    EXPECT_EQ(Lines(summary.out).at(2), "points                     n/a");
    EXPECT_EQ(summary.err, "invalid pattern: BeginDwellTime out of range.\n");

    options.json = true;
    const RunResult json = Render(options);
    EXPECT_EQ(json.exitCode, kExitInvalidPattern);
    const Json report = Json::parse(json.out);
    EXPECT_EQ(report["valid"], false);
    EXPECT_EQ(report["description"], "BeginDwellTime out of range. ");
    EXPECT_TRUE(report["point_count"].is_null());
    EXPECT_TRUE(report["loop_time"].is_null());
    EXPECT_TRUE(report["render_seconds"].is_null());
    EXPECT_EQ(directory.Entries(), std::vector<std::string>{"job.json"});
}

struct BadInput {
    const char* jobText;
    const char* errorLine; // after "<job path>: " when it starts with ':'
};

class BadInputTest : public RenderCommandTest, public ::testing::WithParamInterface<BadInput> {};

TEST_P(BadInputTest, ExitsTwoWithOneLineAndLeavesNoOutputFile) {
    RenderOptions options = WithEveryOutput(SmallLineJob());
    ToolTest::WriteFile(*options.jobPath, GetParam().jobText);
    const RunResult run = Render(options);
    EXPECT_EQ(run.exitCode, kExitBadInput);
    EXPECT_EQ(run.out, "");
    const std::string expected = GetParam().errorLine[0] == ':' ? *options.jobPath + GetParam().errorLine
                                                                : std::string(GetParam().errorLine);
    EXPECT_EQ(run.err.rfind(expected, 0), 0u) << run.err;
    EXPECT_EQ(Lines(run.err).size(), 1u);
    EXPECT_EQ(directory.Entries(), std::vector<std::string>{"job.json"});
}

INSTANTIATE_TEST_SUITE_P(
    Jobs, BadInputTest,
    ::testing::Values(
        BadInput{R"({"class": "PatternLine", "Pitch": 0.1)", ": malformed JSON: parse error at line 1"},
        BadInput{R"({"class": "Nothing"})", "class: unknown class \"Nothing\"\n"},
        BadInput{R"({"class": "PatternLine", "Ptch": 0.1})",
                 "Ptch: unknown property or method of IPatternLine\n"},
        BadInput{R"({"class": "PatternLine", "Pitch": true})",
                 "Pitch: value of the wrong type, expected a number (0x80020005)\n"},
        BadInput{R"({"class": "PatternLine", "End": [0.5, 1.5]})",
                 "End: End values not correct (0x80070057)\n"},
        BadInput{R"({"class": "PatternLine", "Pitch": 0})", "Pitch: value refused (0x80070057)\n"},
        BadInput{R"({"class": "CoordinateFloat", "X": 0.5})", "class: CoordinateFloat is not a pattern\n"}));

// The CSV and the stream are complete before the preview fails (its directory is missing); neither may
// appear.
TEST_F(RenderCommandTest, AnOutputThatCannotBeWrittenLeavesNoneOfTheOthers) {
    RenderOptions options = WithEveryOutput(SmallLineJob());
    options.previewPath = (directory / "missing" / "dose.png").string();
    const RunResult run = Render(options);
    EXPECT_EQ(run.exitCode, kExitBadInput);
    EXPECT_EQ(run.err,
              "--preview " + *options.previewPath + ": cannot create the file: No such file or directory\n");
    EXPECT_EQ(directory.Entries(), std::vector<std::string>{"job.json"});
}

// The first point of a line with pre-blanking is the blanked lead-in point of
// trunc(PreBlankingTime / resolution) ticks, standing at the first line point (0.25, 0.5), which is
// (16384 + 0.25 × 32768, 16384 + 0.5 × 32768) = (24576, 32768) in the default alignment ranges.
TEST_F(RenderCommandTest, PreBlankingTimeSetInTheNestedRenderingPropertiesLengthensTheLeadIn) {
    double resolution = 0.0;
    const auto firstRow = [&](double preBlankingTime) {
        Json job = SmallLineJob();
        job["RenderingProperties"] = Json::object({{"PreBlankingTime", preBlankingTime}});
        RenderOptions options = WithJob(job);
        options.json = true;
        options.pointsPath = (directory / "points.csv").string();
        const RunResult run = Render(options);
        EXPECT_EQ(run.exitCode, kExitSuccess) << run.err;
        resolution = Json::parse(run.out)["dwell_time_resolution"].get<double>();
        return Lines(ReadFile(directory / "points.csv")).at(1);
    };
    const auto ticks = [&](double seconds) {
        return std::to_string(static_cast<long>(seconds / resolution));
    };
    const std::string defaultRow = firstRow(1e-6);
    EXPECT_EQ(defaultRow, "0,1,24576,32768," + ticks(1e-6) + ",2");
    const std::string longerRow = firstRow(2e-6);
    EXPECT_EQ(longerRow, "0,1,24576,32768," + ticks(2e-6) + ",2");
    // Without pre-blanking there is no lead-in: the first row is the first exposed line point.
    const std::string withoutRow = firstRow(0.0);
    EXPECT_EQ(withoutRow, "0,1,24576,32768," + ticks(1e-6) + ",1");
}

TEST_F(RenderCommandTest, WithoutAJobTheBuiltInExampleRenders) {
    const RunResult run = Render(RenderOptions{});
    EXPECT_EQ(run.exitCode, kExitSuccess) << run.err;
    EXPECT_EQ(Lines(run.out).at(0), "class                      PatternLine");
}

TEST_F(RenderCommandTest, TheBuiltInExampleIsTheDwellRampExampleFile) {
    EXPECT_EQ(Json::parse(BuiltinExampleJob()), Json::parse(ReadFile(std::filesystem::path(BW_SOURCE_DIR) /
                                                                     "examples" / "line_dwell_ramp.json")));
}

TEST_F(RenderCommandTest, EveryExampleJobRendersValid) {
    int examples = 0;
    for (const auto& entry :
         std::filesystem::directory_iterator(std::filesystem::path(BW_SOURCE_DIR) / "examples")) {
        if (entry.path().extension() != ".json")
            continue;
        ++examples;
        RenderOptions options;
        options.jobPath = entry.path().string();
        const RunResult run = Render(options);
        EXPECT_EQ(run.exitCode, kExitSuccess) << entry.path() << ": " << run.err;
    }
    EXPECT_GE(examples, 3);
}

} // namespace

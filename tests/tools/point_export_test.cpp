#include "tool_test_support.h"

#include "tools/point_export.h"
#include "tools/tool_error.h"

#include <gtest/gtest.h>

#include <sstream>

namespace {

using namespace Norvane::Lumis::Scanning::Tool;
using ToolTest::Lines;

// Two sub patterns: a blanked and an exposed point at the origin offset, played once, and one exposed
// synchronised point at offset (100, 5), played three times.
RenderedScan TwoSubPatterns() {
    RenderedScan scan{};
    scan.dwellTimeResolution = 2.5e-8;
    scan.fieldOfView = {0, 0, 65535, 65535};
    scan.subPatterns.push_back(
        {0, 0, 1, {MakePoint(10, 20, 40, PointFlag_Blank), MakePoint(10, 20, 4, PointFlag_Acquire)}});
    scan.subPatterns.push_back({100, 5, 3, {MakePoint(1, 2, 7, PointFlag_Acquire | PointFlag_Sync)}});
    return scan;
}

TEST(PointExportTest, CsvHasOneRowPerPointRecordWithOffsetsAddedAndRepeatsNotExpanded) {
    std::ostringstream out;
    WritePointsCsv(TwoSubPatterns(), out);
    EXPECT_EQ(Lines(out.str()), (std::vector<std::string>{"sub,repeat,x,y,dwell,flags", "0,1,10,20,40,2",
                                                          "0,1,10,20,4,1", "1,3,101,7,7,129"}));
}

TEST(PointExportTest, StreamPlaysEverySubPatternItsRepeatCountTimesWithBeamOffForBlankedPoints) {
    std::ostringstream out;
    WriteStreamFile(TwoSubPatterns(), out);
    // 2 points × 1 + 1 point × 3 = 5 point lines; dwell unit 2.5e-8 s = 25 ns, so dwell counts are ticks.
    EXPECT_EQ(Lines(out.str()), (std::vector<std::string>{"s16,25ns,dac", "1", "5", "40 10 20 0", "4 10 20 1",
                                                          "7 101 7 1", "7 101 7 1", "7 101 7 1"}));
}

TEST(PointExportTest, StreamRefusesPointsItsFormatCannotHold) {
    RenderedScan beyondDac = TwoSubPatterns();
    beyondDac.subPatterns[1].points[0] = MakePoint(65500, 2, 7, PointFlag_Acquire); // 65500 + 100 > 65535
    RenderedScan zeroDwell = TwoSubPatterns();
    zeroDwell.subPatterns[0].points[1].dwell = 0;
    for (const RenderedScan& scan : {beyondDac, zeroDwell}) {
        std::ostringstream out;
        EXPECT_THROW(WriteStreamFile(scan, out), ToolError);
        EXPECT_EQ(out.str(), "") << "nothing is written before the check";
    }
}

struct Resolution {
    double seconds;
    std::uint32_t nanoseconds; // 0: not whole, refused
};

class WholeNanosecondsTest : public ::testing::TestWithParam<Resolution> {};

TEST_P(WholeNanosecondsTest, AcceptsOnlyWholeNanosecondResolutions) {
    if (GetParam().nanoseconds == 0) {
        EXPECT_THROW(WholeNanoseconds(GetParam().seconds), ToolError);
    } else {
        EXPECT_EQ(WholeNanoseconds(GetParam().seconds), GetParam().nanoseconds);
    }
}

// 1.5e-8 × 1e9 is 15.000000000000002 in doubles: decimal resolutions carry rounding noise and still count
// as whole.
INSTANTIATE_TEST_SUITE_P(Resolutions, WholeNanosecondsTest,
                         ::testing::Values(Resolution{2.5e-8, 25}, Resolution{1.5e-8, 15},
                                           Resolution{1e-7, 100}, Resolution{1e-9, 1},
                                           Resolution{1.6384e-3, 1638400}, Resolution{2.5e-9, 0},
                                           Resolution{1e-10, 0}, Resolution{0.0, 0}, Resolution{-2.5e-8, 0}));

TEST(PointExportTest, TheRefusalOfAResolutionSaysWhy) {
    try {
        WholeNanoseconds(2.5e-9);
        FAIL();
    } catch (const ToolError& error) {
        EXPECT_STREQ(error.what(), "--stream: the dwell time resolution 2.5e-09 s is not a whole number of "
                                   "nanoseconds, which a stream file requires");
    }
}

} // namespace

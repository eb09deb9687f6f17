#include "shapes/line_generator.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

// Defaults throughout: alignment 16384..49152 (span 32768) on both axes, resolution 2.5e-8 s, factor 4095,
// pre- and post-blanking 1e-6 s, start asymmetry 5e-8 s.
class LineGeneratorTest : public ::testing::Test {
  protected:
    std::vector<PatternPoint> Write(const LineGeometry& line) {
        std::vector<PatternPoint> points(static_cast<std::size_t>(LineListPointCount(line, pattern_)));
        WriteLinePoints(points, line, pattern_);
        return points;
    }

    CPattern pattern_{ScanDeviceConfig{}};
};

LineGeometry HorizontalLine(double beginX, double endX) {
    LineGeometry line;
    line.begin = {beginX, 0.5};
    line.end = {endX, 0.5};
    return line;
}

// Pre-blanking 1e-6 / 2.5e-8 = 40 ticks (blank), asymmetry 5e-8 / 2.5e-8 = 2 ticks (no flags), one point
// each.
void ExpectLeadIn(const std::vector<PatternPoint>& points, std::uint16_t x, std::uint16_t y) {
    EXPECT_EQ(points[0], MakePoint(x, y, 40, PointFlag_Blank));
    EXPECT_EQ(points[1], MakePoint(x, y, 2, 0));
}

TEST_F(LineGeneratorTest, DefaultDiagonalEndsOnTheEndPoint) {
    // L = sqrt(2) = 1.41421, N = trunc(14.142) + 1 = 15; theta = 45 degrees:
    // sX = sY = trunc(32768 * cos45 * 0.1) = trunc(2317.05) = 2317; anchor DAC(1, 1) = (49152, 49152);
    // first = 49152 - 14 * 2317 = 16714. Dwell 1e-6 / 2.5e-8 = 40 ticks.
    const LineGeometry line;
    const LineLayout layout = LayOutLine(line, pattern_);
    EXPECT_EQ(layout.count, 15);
    EXPECT_EQ(layout.step.x, 2317.0);
    EXPECT_EQ(layout.step.y, 2317.0);
    EXPECT_EQ(layout.anchor, (DacPosition{49152, 49152}));
    EXPECT_EQ(layout.first, (DacPosition{16714, 16714}));

    // 2 lead-in + 15 + 1 post-blanking.
    const auto points = Write(line);
    ASSERT_EQ(points.size(), 18u);
    ExpectLeadIn(points, 16714, 16714);
    for (std::uint16_t i = 0; i < 15; ++i) {
        const auto position = static_cast<std::uint16_t>(16714 + i * 2317);
        EXPECT_EQ(points[2 + i], MakePoint(position, position, 40, PointFlag_Acquire)) << "point " << i;
    }
    EXPECT_EQ(points[17], MakePoint(49152, 49152, 40, PointFlag_Blank));
}

TEST_F(LineGeneratorTest, RemainderOfThePitchLiesBeforeTheFirstPoint) {
    // (0.25, 0.5) to (0.6, 0.5): L = 0.35, N = trunc(3.4999) + 1 = 4; sX = trunc(3276.8) = 3276, sY = 0.
    // Anchor DAC(0.6) = trunc(16384 + 19660.8) = 36044; first = 36044 - 3 * 3276 = 26216, which is
    // 1640 units after DAC(Begin) = 24576. Y = 16384 + 16384 = 32768.
    const auto points = Write(HorizontalLine(0.25, 0.6));
    ASSERT_EQ(points.size(), 7u);
    ExpectLeadIn(points, 26216, 32768);
    const std::uint16_t expectedX[] = {26216, 29492, 32768, 36044};
    for (std::size_t i = 0; i < 4; ++i)
        EXPECT_EQ(points[2 + i], MakePoint(expectedX[i], 32768, 40, PointFlag_Acquire)) << "point " << i;
    EXPECT_EQ(points[6], MakePoint(36044, 32768, 40, PointFlag_Blank));
}

TEST_F(LineGeneratorTest, ReverseDirectionEndsExactlyOnBeginAndStartsWithTheBeginDwell) {
    // Same line reversed: anchor DAC(Begin) = 24576, steps -3276: first = 24576 + 3 * 3276 = 34404.
    // Dwell 1e-6 -> 4e-6 over N = 4: delta = 3e-6 / 3 / 2.5e-8 = 40 ticks: 40, 80, 120, 160.
    LineGeometry line = HorizontalLine(0.25, 0.6);
    line.scanDirection = ScanDirection_Reverse;
    line.endDwellTime = 4e-6;
    const auto points = Write(line);
    ASSERT_EQ(points.size(), 7u);
    ExpectLeadIn(points, 34404, 32768);
    const std::uint16_t expectedX[] = {34404, 31128, 27852, 24576};
    const std::uint16_t expectedDwell[] = {40, 80, 120, 160};
    for (std::size_t i = 0; i < 4; ++i)
        EXPECT_EQ(points[2 + i], MakePoint(expectedX[i], 32768, expectedDwell[i], PointFlag_Acquire))
            << "point " << i;
    EXPECT_EQ(points[6], MakePoint(24576, 32768, 40, PointFlag_Blank));
}

TEST_F(LineGeneratorTest, DwellRampRunsFromBeginToEndDwell) {
    // (0, 0.5) to (0.2, 0.5): N = 0.2 / 0.1 + 1 = 3. Dwell 1e-6 -> 3e-6 at r = 2.5e-8:
    // d0 = 40, delta = 2e-6 / 2 / 2.5e-8 = 40: 40, 80, 120.
    LineGeometry line = HorizontalLine(0.0, 0.2);
    line.endDwellTime = 3e-6;
    pattern_.UpdateDwellTimeResolution(3e-6);
    ASSERT_EQ(pattern_.GetDwellTimeResolution(), 2.5e-8);
    const auto points = Write(line);
    ASSERT_EQ(points.size(), 6u);
    EXPECT_EQ(points[2].dwell, 40);
    EXPECT_EQ(points[3].dwell, 80);
    EXPECT_EQ(points[4].dwell, 120);
}

TEST_F(LineGeneratorTest, PositionsStayOnTheGridAcrossRunsOfEqualDwell) {
    // Default diagonal, dwell 1e-6 -> 1.1e-6: delta = 1e-7 / 14 / 2.5e-8 = 0.2857 ticks, so
    // trunc(40 + 0.2857 i) repeats: 40 x4, 41 x3, 42 x4, 43 x3, 44.
    LineGeometry line;
    line.endDwellTime = 1.1e-6;
    const auto points = Write(line);
    const std::uint16_t expectedDwell[] = {40, 40, 40, 40, 41, 41, 41, 42, 42, 42, 42, 43, 43, 43, 44};
    for (std::uint16_t i = 0; i < 15; ++i) {
        const auto position = static_cast<std::uint16_t>(16714 + i * 2317);
        EXPECT_EQ(points[2 + i], MakePoint(position, position, expectedDwell[i], PointFlag_Acquire))
            << "point " << i;
    }
}

TEST_F(LineGeneratorTest, ReturnPassMirrorsTheForwardPass) {
    // Default diagonal with a ramp: 2 lead-in + 2 x 15 + 1. Point N + j equals point N - 1 - j; the
    // post-blanking point stands where the return pass ends, on the first point (16714, 16714).
    LineGeometry line;
    line.endDwellTime = 2e-6;
    line.multiPass = MultiPass_OneOrientation;
    const auto points = Write(line);
    ASSERT_EQ(points.size(), 33u);
    ExpectLeadIn(points, 16714, 16714);
    for (std::size_t j = 0; j < 15; ++j)
        EXPECT_EQ(points[2 + 15 + j], points[2 + 14 - j]) << "return point " << j;
    EXPECT_EQ(points[2 + 15], MakePoint(49152, 49152, 80, PointFlag_Acquire));
    EXPECT_EQ(points[32], MakePoint(16714, 16714, 40, PointFlag_Blank));
}

TEST_F(LineGeneratorTest, SteepLineWhoseXStepTruncatesToZeroKeepsOneX) {
    // (0.5, 0) to (0.5001, 1): N = trunc(10.00000005) + 1 = 11; sX = trunc(0.3277) = 0,
    // sY = trunc(3276.79998) = 3276; X = DAC(0.5001) = trunc(16384 + 16387.28) = 32771 everywhere.
    LineGeometry line;
    line.begin = {0.5, 0.0};
    line.end = {0.5001, 1.0};
    const auto points = Write(line);
    ASSERT_EQ(points.size(), 14u);
    for (const PatternPoint& point : points)
        EXPECT_EQ(point.x, 32771);
    EXPECT_EQ(points[2].y, 49152 - 10 * 3276);
    EXPECT_EQ(points[12].y, 49152);
}

TEST_F(LineGeneratorTest, ZeroLengthLineIsOnePointAtTheAnchor) {
    // N = trunc(0 / 0.1) + 1 = 1; DAC(0.5, 0.5) = (32768, 32768); no ramp: d0 = 1e-6 / 2.5e-8 = 40.
    LineGeometry line;
    line.begin = {0.5, 0.5};
    line.end = {0.5, 0.5};
    line.endDwellTime = 3e-6;
    EXPECT_EQ(LineDwellRamp(line, 1, 2.5e-8).increment, 0.0);
    const auto points = Write(line);
    ASSERT_EQ(points.size(), 4u);
    EXPECT_EQ(points[2], MakePoint(32768, 32768, 40, PointFlag_Acquire));
}

TEST_F(LineGeneratorTest, PitchTooFineForOnePointListIsRefused) {
    // sqrt(2) / 1e-10 = 1.4e10 points, beyond the 2147483647 a list holds.
    LineGeometry line;
    line.pitch = 1e-10;
    EXPECT_THROW(LinePointCount(line), std::invalid_argument);
    // 1e-9 gives 1414213563 points for one pass, but twice that does not fit.
    line.pitch = 1e-9;
    EXPECT_EQ(LinePointCount(line), 1414213563);
    line.multiPass = MultiPass_OneOrientation;
    EXPECT_THROW(LineListPointCount(line, pattern_), std::invalid_argument);
}

TEST_F(LineGeneratorTest, ListShorterThanTheLineIsRefused) {
    std::vector<PatternPoint> points(17);
    EXPECT_THROW(WriteLinePoints(points, LineGeometry{}, pattern_), std::invalid_argument);
}

} // namespace
} // namespace Norvane::Lumis::Scanning

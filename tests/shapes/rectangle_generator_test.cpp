#include "shapes/rectangle_generator.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

// Defaults throughout: alignment 16384..49152 (span 32768) on both axes, resolution 2.5e-8 s, factor 4095,
// pre- and post-blanking 1e-6 s, start asymmetry 5e-8 s: lead-in L = 2 (40 ticks blank, 2 ticks no flags),
// post-blanking B = 1 (40 ticks blank).
// Pitch 0.1: sx = sy = trunc(32768 * 0.1) = 3276. Full rectangle: kx = ky = trunc(32768 / 3276) = 10,
// so 11 points per row and 11 rows, anchored at the far edge: first = 49152 - 10 * 3276 = 16392.
class RectangleGeneratorTest : public ::testing::Test {
  protected:
    std::vector<PatternPoint> Write(const RectangleGeometry& geometry,
                                    std::uint8_t flags = PointFlag_Acquire) {
        std::vector<PatternPoint> points(
            static_cast<std::size_t>(RectangleListPointCount(geometry, pattern_)));
        WriteRectanglePoints(points, geometry, pattern_, flags);
        return points;
    }

    void UseFullDacField() {
        PatternRenderingSettings settings = pattern_.GetRenderingSettings();
        settings.alignmentX.range = {0, 65535};
        settings.alignmentY.range = {0, 65535};
        pattern_.SetRenderingSettings(settings);
    }

    CPattern pattern_{ScanDeviceConfig{}};
};

constexpr std::uint16_t kFirst = 16392;
constexpr std::uint16_t kPitch = 3276;

std::uint16_t GridAt(int index, std::uint16_t first = kFirst) {
    return static_cast<std::uint16_t>(first + index * kPitch);
}

void ExpectLeadIn(const std::vector<PatternPoint>& points, std::size_t at, std::uint16_t x, std::uint16_t y) {
    EXPECT_EQ(points[at], MakePoint(x, y, 40, PointFlag_Blank)) << "pre-blanking at " << at;
    EXPECT_EQ(points[at + 1], MakePoint(x, y, 2, 0)) << "asymmetry at " << at + 1;
}

// The band 0 <= y <= 0.2: Y2 = trunc(16384 + 6553.6) = 22937, ky = trunc(6553 / 3276) = 2, so three rows at
// 22937 - 2 * 3276 = 16385, 19661 and 22937.
RectangleGeometry ThreeRowBand() {
    RectangleGeometry geometry;
    geometry.rectangle = {0.0, 0.0, 1.0, 0.2};
    return geometry;
}

TEST_F(RectangleGeneratorTest, DefaultGridAndSolidRows) {
    const RectangleGeometry geometry;
    const RectangleGrid grid = LayOutGrid(geometry, pattern_);
    EXPECT_EQ(grid.topLeft, (DacPosition{16384, 16384}));
    EXPECT_EQ(grid.bottomRight, (DacPosition{49152, 49152}));
    EXPECT_EQ(grid.stepX, 3276);
    EXPECT_EQ(grid.stepY, 3276);
    EXPECT_EQ(grid.columns, 11);
    EXPECT_EQ(grid.rows, 11);
    EXPECT_EQ(RectanglePassPointCount(geometry, grid), 121.0);

    // 2 + 121 + 1.
    const auto points = Write(geometry);
    ASSERT_EQ(points.size(), 124u);
    ExpectLeadIn(points, 0, kFirst, kFirst);
    for (int row = 0; row < 11; ++row)
        for (int column = 0; column < 11; ++column)
            EXPECT_EQ(points[static_cast<std::size_t>(2 + row * 11 + column)],
                      MakePoint(GridAt(column), GridAt(row), 40, PointFlag_Acquire))
                << "row " << row << " column " << column;
    EXPECT_EQ(points[123], MakePoint(49152, 49152, 40, PointFlag_Blank));
}

TEST_F(RectangleGeneratorTest, ZeroWidthRectangleGivesOnePointPerRow) {
    // X1 = X2 = 16384 + 16384 = 32768: kx = 0, one point per row, 11 rows.
    RectangleGeometry geometry;
    geometry.rectangle = {0.5, 0.0, 0.5, 1.0};
    const auto points = Write(geometry);
    ASSERT_EQ(points.size(), 2u + 11u + 1u);
    for (int row = 0; row < 11; ++row)
        EXPECT_EQ(points[static_cast<std::size_t>(2 + row)],
                  MakePoint(32768, GridAt(row), 40, PointFlag_Acquire));
}

TEST_F(RectangleGeneratorTest, ZeroWidthFrameStillWritesOnePointPerHorizontalRun) {
    // segX = max(0, 1) = 1, segY = 10: (1 + 10) * 2 = 22 outline points from (X1, Y1) = (32768, 16384).
    // Top: (32768, 16384), ends at 36044. Right: x 36044, y 16384 + j * 3276 (j < 10), ends at y 49144.
    // Bottom: (36044, 49144), ends at 32768. Left: x 32768, y 49144 - j * 3276, last 49144 - 9 * 3276 =
    // 19660.
    RectangleGeometry geometry;
    geometry.rectangle = {0.5, 0.0, 0.5, 1.0};
    geometry.strategy.fillStyle = FillStyle_Frame;
    const auto points = Write(geometry);
    ASSERT_EQ(points.size(), 2u + 22u + 1u);
    ExpectLeadIn(points, 0, 32768, 16384);
    EXPECT_EQ(points[2], MakePoint(32768, 16384, 40, PointFlag_Acquire));
    for (int j = 0; j < 10; ++j)
        EXPECT_EQ(points[static_cast<std::size_t>(3 + j)],
                  MakePoint(36044, static_cast<std::uint16_t>(16384 + j * kPitch), 40, PointFlag_Acquire));
    EXPECT_EQ(points[13], MakePoint(36044, 49144, 40, PointFlag_Acquire));
    for (int j = 0; j < 10; ++j)
        EXPECT_EQ(points[static_cast<std::size_t>(14 + j)],
                  MakePoint(32768, static_cast<std::uint16_t>(49144 - j * kPitch), 40, PointFlag_Acquire));
    EXPECT_EQ(points[24], MakePoint(32768, 19660, 40, PointFlag_Blank));
}

TEST_F(RectangleGeneratorTest, FrameRunsClockwiseFromTheTopLeftCornerAtTheBeginDwell) {
    // segX = segY = 10, 40 outline points. Top: x = 16384 + i * 3276 (i < 10), ends at 49144.
    // Right: y = 16384 + i * 3276, ends at 49144. Bottom: x = 49144 - i * 3276. Left: y = 49144 - i * 3276,
    // last 49144 - 9 * 3276 = 19660. End dwell 4e-6 is not used: every point 40 ticks.
    RectangleGeometry geometry;
    geometry.strategy.fillStyle = FillStyle_Frame;
    geometry.endDwellTime = 4e-6;
    const RectangleGrid grid = LayOutGrid(geometry, pattern_);
    EXPECT_EQ(RectanglePassPointCount(geometry, grid), 40.0);

    const auto points = Write(geometry);
    ASSERT_EQ(points.size(), 2u + 40u + 1u);
    ExpectLeadIn(points, 0, 16384, 16384);
    for (int i = 0; i < 10; ++i) {
        const auto rising = static_cast<std::uint16_t>(16384 + i * kPitch);
        const auto falling = static_cast<std::uint16_t>(49144 - i * kPitch);
        const auto at = static_cast<std::size_t>(2 + i);
        EXPECT_EQ(points[at], MakePoint(rising, 16384, 40, PointFlag_Acquire)) << "top " << i;
        EXPECT_EQ(points[at + 10], MakePoint(49144, rising, 40, PointFlag_Acquire)) << "right " << i;
        EXPECT_EQ(points[at + 20], MakePoint(falling, 49144, 40, PointFlag_Acquire)) << "bottom " << i;
        EXPECT_EQ(points[at + 30], MakePoint(16384, falling, 40, PointFlag_Acquire)) << "left " << i;
    }
    EXPECT_EQ(points[42], MakePoint(16384, 19660, 40, PointFlag_Blank));
}

TEST_F(RectangleGeneratorTest, DwellRampsOverTheRowsFromBeginToEnd) {
    // 1e-6 s to 2e-6 s over 11 rows at 2.5e-8 s: 40 ticks, step 1e-6 / 10 / 2.5e-8 = 4 per row, 80 at the
    // last row; every point of a row shares its dwell.
    RectangleGeometry geometry;
    geometry.endDwellTime = 2e-6;
    const auto points = Write(geometry);
    for (int row = 0; row < 11; ++row)
        for (int column = 0; column < 11; ++column)
            EXPECT_EQ(points[static_cast<std::size_t>(2 + row * 11 + column)].dwell, 40 + 4 * row)
                << "row " << row << " column " << column;
}

TEST_F(RectangleGeneratorTest, SerpentineRowsAlternateFromWhereThePreviousRowEnded) {
    RectangleGeometry geometry = ThreeRowBand();
    geometry.strategy.scanType = ScanType_Serpentine;
    const auto points = Write(geometry);
    ASSERT_EQ(points.size(), 2u + 33u + 1u);
    const std::uint16_t rowY[] = {16385, 19661, 22937};
    for (int column = 0; column < 11; ++column) {
        const auto at = static_cast<std::size_t>(2 + column);
        EXPECT_EQ(points[at], MakePoint(GridAt(column), rowY[0], 40, PointFlag_Acquire));
        EXPECT_EQ(points[at + 11], MakePoint(GridAt(10 - column), rowY[1], 40, PointFlag_Acquire));
        EXPECT_EQ(points[at + 22], MakePoint(GridAt(column), rowY[2], 40, PointFlag_Acquire));
    }
    EXPECT_EQ(points[35], MakePoint(49152, 22937, 40, PointFlag_Blank));
}

TEST_F(RectangleGeneratorTest, VerticalLinesAreColumnsWithTheRampOverColumns) {
    // The band has 11 columns of 3 points; the ramp 1e-6 -> 2e-6 runs over the 11 columns (4 ticks each),
    // not over the 3 rows.
    RectangleGeometry geometry = ThreeRowBand();
    geometry.strategy.orientation = ScanOrientation_Vertical;
    geometry.endDwellTime = 2e-6;
    const auto points = Write(geometry);
    const std::uint16_t rowY[] = {16385, 19661, 22937};
    for (int column = 0; column < 11; ++column)
        for (int row = 0; row < 3; ++row)
            EXPECT_EQ(points[static_cast<std::size_t>(2 + column * 3 + row)],
                      MakePoint(GridAt(column), rowY[row], static_cast<std::uint16_t>(40 + 4 * column),
                                PointFlag_Acquire))
                << "column " << column << " row " << row;
}

TEST_F(RectangleGeneratorTest, ReversedDirectionsAnchorTheGridAtTheLowEdges) {
    // Line direction reverse: rows end on X1 = 16384 and start at 16384 + 10 * 3276 = 49144. Frame direction
    // reverse: the last row lies on Y1 = 16384, the first on 49144.
    RectangleGeometry geometry;
    geometry.strategy.lineDirection = ScanDirection_Reverse;
    geometry.strategy.frameDirection = ScanDirection_Reverse;
    const auto points = Write(geometry);
    ExpectLeadIn(points, 0, 49144, 49144);
    for (int row = 0; row < 11; ++row)
        for (int column = 0; column < 11; ++column)
            EXPECT_EQ(points[static_cast<std::size_t>(2 + row * 11 + column)],
                      MakePoint(static_cast<std::uint16_t>(49144 - column * kPitch),
                                static_cast<std::uint16_t>(49144 - row * kPitch), 40, PointFlag_Acquire));
    EXPECT_EQ(points[123], MakePoint(16384, 16384, 40, PointFlag_Blank));
}

TEST_F(RectangleGeneratorTest, ReversedLinesOfAVerticalPassRunUpwards) {
    // Vertical lines: the line direction works on Y (columns start at 49144 and end on Y1 = 16384); the
    // frame direction stays forward on X (first column 16392).
    RectangleGeometry geometry;
    geometry.strategy.orientation = ScanOrientation_Vertical;
    geometry.strategy.lineDirection = ScanDirection_Reverse;
    const auto points = Write(geometry);
    EXPECT_EQ(points[2], MakePoint(kFirst, 49144, 40, PointFlag_Acquire));
    EXPECT_EQ(points[12], MakePoint(kFirst, 16384, 40, PointFlag_Acquire));
    EXPECT_EQ(points[13], MakePoint(GridAt(1), 49144, 40, PointFlag_Acquire));
    EXPECT_EQ(points[122], MakePoint(49152, 16384, 40, PointFlag_Acquire));
}

TEST_F(RectangleGeneratorTest, OneOrientationPassesForwardThenBackFromTheEndDwell) {
    // Two passes of 2 + 121 + 1. The return pass is frame-reversed: rows from 16384 + 10 * 3276 = 49144 up to
    // 16384, with the dwell running from 80 down by 4.
    RectangleGeometry geometry;
    geometry.endDwellTime = 2e-6;
    geometry.strategy.multiPass = MultiPass_OneOrientation;
    geometry.strategy.frameDirection = ScanDirection_Reverse; // not used with two passes
    const auto points = Write(geometry);
    ASSERT_EQ(points.size(), 2u * 124u);
    ExpectLeadIn(points, 0, kFirst, kFirst);
    EXPECT_EQ(points[2], MakePoint(kFirst, kFirst, 40, PointFlag_Acquire));
    EXPECT_EQ(points[123], MakePoint(49152, 49152, 40, PointFlag_Blank));
    ExpectLeadIn(points, 124, kFirst, 49144);
    for (int row = 0; row < 11; ++row)
        EXPECT_EQ(points[static_cast<std::size_t>(126 + row * 11)],
                  MakePoint(kFirst, static_cast<std::uint16_t>(49144 - row * kPitch),
                            static_cast<std::uint16_t>(80 - 4 * row), PointFlag_Acquire))
            << "row " << row;
    EXPECT_EQ(points[247], MakePoint(49152, 16384, 40, PointFlag_Blank));
}

TEST_F(RectangleGeneratorTest, AllOrientationsAddsTwoVerticalPasses) {
    // Four passes of 124 points. Pass 3 (index 248): vertical, forward: first column x 16392, y 16392.
    // Pass 4 (index 372): vertical, frame-reversed on X: first column x 49144, y 16392, ramp from 80.
    RectangleGeometry geometry;
    geometry.endDwellTime = 2e-6;
    geometry.strategy.multiPass = MultiPass_AllOrientations;
    geometry.strategy.orientation = ScanOrientation_Vertical; // not used with four passes
    const auto points = Write(geometry);
    ASSERT_EQ(points.size(), 4u * 124u);
    EXPECT_EQ(points[3], MakePoint(GridAt(1), kFirst, 40, PointFlag_Acquire)); // horizontal first pass
    EXPECT_EQ(points[126], MakePoint(kFirst, 49144, 80, PointFlag_Acquire));
    ExpectLeadIn(points, 248, kFirst, kFirst);
    EXPECT_EQ(points[251], MakePoint(kFirst, GridAt(1), 40, PointFlag_Acquire));
    EXPECT_EQ(points[250 + 11], MakePoint(GridAt(1), kFirst, 44, PointFlag_Acquire));
    ExpectLeadIn(points, 372, 49144, kFirst);
    EXPECT_EQ(points[374 + 11], MakePoint(49144 - kPitch, kFirst, 76, PointFlag_Acquire));
    EXPECT_EQ(points[495], MakePoint(16384, 49152, 40, PointFlag_Blank));
}

TEST_F(RectangleGeneratorTest, UnknownEnumerationsFallBackToSolidHorizontalRasterOnePass) {
    RectangleGeometry plain;
    RectangleGeometry odd;
    odd.strategy.fillStyle = static_cast<FillStyle>(7);
    odd.strategy.multiPass = static_cast<MultiPass>(9);
    odd.strategy.orientation = static_cast<ScanOrientation>(5);
    odd.strategy.scanType = static_cast<ScanType>(3);
    EXPECT_EQ(RectanglePassCount(odd.strategy), 1);
    EXPECT_EQ(Write(odd), Write(plain));
}

TEST_F(RectangleGeneratorTest, ExclusionFlagsMarkOnlyThePatternPoints) {
    const auto points = Write(RectangleGeometry{}, PointFlag_Blank);
    ExpectLeadIn(points, 0, kFirst, kFirst);
    for (std::size_t i = 2; i < 123; ++i)
        EXPECT_EQ(points[i].flags, PointFlag_Blank) << i;
}

TEST_F(RectangleGeneratorTest, PitchBelowOneDacStepIsAGridProblem) {
    // 32768 * 1e-5 = 0.33: no whole DAC step.
    RectangleGeometry geometry;
    geometry.strategy.pitchX = 1e-5;
    EXPECT_EQ(RectangleGridProblems(geometry, pattern_), "PitchX out of range. ");
    geometry.strategy.pitchY = 1e-5;
    EXPECT_EQ(RectangleGridProblems(geometry, pattern_), "PitchX out of range. PitchY out of range. ");
    EXPECT_EQ(LayOutGrid(geometry, pattern_).columns, 0);
    std::vector<PatternPoint> points(200);
    EXPECT_THROW(WriteRectanglePoints(points, geometry, pattern_, PointFlag_Acquire), std::invalid_argument);
    EXPECT_EQ(RectangleGridProblems(RectangleGeometry{}, pattern_), "");
}

TEST_F(RectangleGeneratorTest, PointCountBeyondAListIsAGridProblemInsteadOfWrapping) {
    // Field 0..65535 with pitch 1.5 / 65535: sx = sy = trunc(1.5) = 1, 65536 * 65536 = 2^32 points.
    UseFullDacField();
    RectangleGeometry geometry;
    geometry.strategy.pitchX = 1.5 / 65535.0;
    geometry.strategy.pitchY = 1.5 / 65535.0;
    EXPECT_EQ(RectangleGridProblems(geometry, pattern_), "Pitch out of range. ");
    EXPECT_THROW(RectangleListPointCount(geometry, pattern_), std::invalid_argument);

    // Half the height: Y2 = trunc(32767.5), 65536 * 32768 = 2^31 > 2^31 - 1 still; a quarter (16384 rows)
    // fits.
    geometry.rectangle.bottom = 0.5;
    EXPECT_EQ(RectangleGridProblems(geometry, pattern_), "Pitch out of range. ");
    geometry.rectangle.bottom = 0.25;
    EXPECT_EQ(RectangleGridProblems(geometry, pattern_), "");
}

TEST_F(RectangleGeneratorTest, ListShorterThanThePatternIsRefused) {
    std::vector<PatternPoint> points(123);
    EXPECT_THROW(WriteRectanglePoints(points, RectangleGeometry{}, pattern_, PointFlag_Acquire),
                 std::invalid_argument);
}

} // namespace
} // namespace Norvane::Lumis::Scanning

#include "tools/colour_map.h"
#include "tools/dose_preview.h"
#include "tools/tool_error.h"

#include <gtest/gtest.h>

namespace {

using namespace Norvane::Lumis::Scanning::Tool;

struct FieldSize {
    DacRectangle field;
    PreviewSize size;
};

class PreviewSizeTest : public ::testing::TestWithParam<FieldSize> {};

TEST_P(PreviewSizeTest, LongerSideAtMost1024WithTheFieldsAspect) {
    EXPECT_EQ(PreviewSizeFor(GetParam().field, 1024), GetParam().size);
}

INSTANTIATE_TEST_SUITE_P(Fields, PreviewSizeTest,
                         ::testing::Values(
                             // Default alignment ranges 16384..49152: 32769 positions per axis.
                             FieldSize{{16384, 16384, 49152, 49152}, {1024, 1024}},
                             // 65536 × 32769 positions: 1024 × round(1024 × 32769 / 65536) = 1024 × 512.
                             FieldSize{{0, 16384, 65535, 49152}, {1024, 512}},
                             // A field narrower than 1024 positions gets one pixel per position.
                             FieldSize{{0, 0, 99, 49}, {100, 50}}, FieldSize{{7, 7, 7, 7}, {1, 1}},
                             // 10000 × 1 positions: the short side keeps one pixel.
                             FieldSize{{0, 0, 9999, 0}, {1024, 1}}));

TEST(PreviewSizeTest, AnEmptyFieldIsRefused) {
    EXPECT_THROW(PreviewSizeFor({5, 0, 4, 0}, 1024), ToolError);
}

double DoseAt(const std::vector<double>& dose, PreviewSize size, int column, int row) {
    return dose[static_cast<std::size_t>(row * size.width + column)];
}

TEST(DoseTest, SumsDwellTimesRepeatsOfUnblankedPointsPerPixel) {
    RenderedScan scan{};
    scan.dwellTimeResolution = 0.5;
    scan.fieldOfView = {0, 0, 99, 49};
    scan.subPatterns.push_back({0,
                                0,
                                1,
                                {MakePoint(10, 20, 4, PointFlag_Acquire), MakePoint(10, 20, 2, 0),
                                 MakePoint(10, 20, 40, PointFlag_Blank)}});
    // Offset (5, 5), played 3 times; the second point lands at x = 100, outside the field.
    scan.subPatterns.push_back(
        {5, 5, 3, {MakePoint(0, 0, 1, PointFlag_Acquire), MakePoint(95, 0, 1, PointFlag_Acquire)}});
    const PreviewSize size{100, 50};
    const std::vector<double> dose = AccumulateDose(scan, size);
    EXPECT_EQ(DoseAt(dose, size, 10, 20), (4 + 2) * 0.5) << "the blanked point adds nothing";
    EXPECT_EQ(DoseAt(dose, size, 5, 5), 1 * 0.5 * 3);
    double total = 0.0;
    for (double d : dose)
        total += d;
    EXPECT_EQ(total, 3.0 + 1.5) << "nothing else is exposed";
}

TEST(DoseTest, APixelCollectsEveryDacPositionItCovers) {
    // 2048 × 1024 positions on 1024 × 512 pixels: two positions per pixel and axis.
    RenderedScan scan{};
    scan.dwellTimeResolution = 1.0;
    scan.fieldOfView = {0, 0, 2047, 1023};
    scan.subPatterns.push_back(
        {0,
         0,
         1,
         {MakePoint(0, 0, 1, PointFlag_Acquire), MakePoint(1, 1, 2, PointFlag_Acquire),
          MakePoint(2, 0, 4, PointFlag_Acquire), MakePoint(2047, 1023, 8, PointFlag_Acquire)}});
    const PreviewSize size = PreviewSizeFor(scan.fieldOfView, 1024);
    ASSERT_EQ(size, (PreviewSize{1024, 512}));
    const std::vector<double> dose = AccumulateDose(scan, size);
    EXPECT_EQ(DoseAt(dose, size, 0, 0), 3.0);
    EXPECT_EQ(DoseAt(dose, size, 1, 0), 4.0);
    EXPECT_EQ(DoseAt(dose, size, 1023, 511), 8.0);
}

std::vector<Rgb> Colours(const RgbImage& image) {
    std::vector<Rgb> colours;
    for (std::size_t i = 0; i + 2 < image.pixels.size(); i += 3)
        colours.push_back({image.pixels[i], image.pixels[i + 1], image.pixels[i + 2]});
    return colours;
}

TEST(DoseTest, ColoursOnALogScaleBetweenTheSmallestAndLargestNonzeroDoseWithBlackForNone) {
    // log(10 / 1) / log(100 / 1) = 0.5.
    const RgbImage image = ColourDose({0.0, 1.0, 10.0, 100.0}, {4, 1});
    ASSERT_EQ(image.width, 4);
    ASSERT_EQ(image.height, 1);
    EXPECT_EQ(Colours(image),
              (std::vector<Rgb>{{0, 0, 0}, ViridisColour(0.0), ViridisColour(0.5), ViridisColour(1.0)}));
}

TEST(DoseTest, ASingleDoseLevelTakesTheTopColour) {
    EXPECT_EQ(Colours(ColourDose({0.0, 5.0, 5.0}, {3, 1})),
              (std::vector<Rgb>{{0, 0, 0}, ViridisColour(1.0), ViridisColour(1.0)}));
}

double Luminance(Rgb c) {
    return 0.2126 * c.r + 0.7152 * c.g + 0.0722 * c.b;
}

TEST(ColourMapTest, RunsFromDarkVioletToBrightYellowWithRisingBrightnessAndNeverBlack) {
    const Rgb low = ViridisColour(0.0);
    const Rgb high = ViridisColour(1.0);
    EXPECT_GT(low.b, low.g);
    EXPECT_GT(low.r, low.g);
    EXPECT_GT(high.r, 200);
    EXPECT_GT(high.g, 200);
    EXPECT_LT(high.b, 60);
    for (int i = 1; i <= 20; ++i) {
        EXPECT_GT(Luminance(ViridisColour(i / 20.0)), Luminance(ViridisColour((i - 1) / 20.0))) << i;
        EXPECT_GT(Luminance(ViridisColour(i / 20.0)), 10.0);
    }
}

TEST(ColourMapTest, ClampsOutsideZeroToOne) {
    EXPECT_EQ(ViridisColour(-3.0), ViridisColour(0.0));
    EXPECT_EQ(ViridisColour(7.0), ViridisColour(1.0));
}

} // namespace

#include "composition/point_filter.h"
#include "core/point_buffer_view.h"
#include "dwellmap/pattern_point_list.h"
#include "module/geometry_io.h"
#include "module/hresult_exception.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>
#include <random>
#include <stdexcept>
#include <string>
#include <vector>

using namespace Norvane::Lumis;
using namespace Norvane::Lumis::Scanning;

namespace {

using Points = std::vector<PatternPoint>;
using ContainsFunction = std::function<bool(coordinate<double>)>;

// Positions are on a 0..100 DAC field, so DAC 50 is relative 0.5.
constexpr RangeInt kField{0, 100};

PatternPoint LeadBlank(std::uint16_t x, std::uint16_t y = 0) {
    return MakePoint(x, y, 40, PointFlag_Blank);
}
PatternPoint Asymmetry(std::uint16_t x, std::uint16_t y = 0) {
    return MakePoint(x, y, 2, 0);
}
PatternPoint Exposing(std::uint16_t x, std::uint16_t y = 0) {
    return MakePoint(x, y, 7, PointFlag_Acquire);
}

// The band of relative x from 0.45 to 0.55 (DAC 45 to 55 on the test field), edges included.
bool InMiddleBand(coordinate<double> p) {
    return p.x >= 0.45 && p.x <= 0.55;
}

// Filters a copy of points held in a block of exactly their size, so that a write past the end is
// caught by the address sanitizer, and returns the points kept.
Points Filter(const Points& points, const ContainsFunction& contains, std::uint16_t offsetX = 0,
              std::uint16_t offsetY = 0, const TransformationMatrix& matrix = {}, RangeInt range = kField) {
    auto block = std::make_unique<PatternPoint[]>(points.size());
    std::copy(points.begin(), points.end(), block.get());
    const ShapeView shape{.matrix = matrix, .rangeX = range, .rangeY = range, .contains = &contains};
    const std::uint32_t kept = FilterPoints({block.get(), points.size()}, offsetX, offsetY, shape);
    EXPECT_LE(kept, points.size());
    return {block.get(), block.get() + kept};
}

struct RenderingCase {
    std::string name;
    Points input;
    Points expected;
};

class NormalRenderingTest : public ::testing::TestWithParam<RenderingCase> {};

TEST_P(NormalRenderingTest, FilteredThroughTheMiddleBand) {
    EXPECT_EQ(Filter(GetParam().input, InMiddleBand), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(
    Cases, NormalRenderingTest,
    ::testing::Values(
        // The lead-in is regenerated at the first point (40 and 2 ticks) and the post-blanking point is
        // rewritten at the last one: the same list.
        RenderingCase{
            "AllOutsideUnchanged",
            {LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(20), Exposing(90), LeadBlank(90)},
            {LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(20), Exposing(90), LeadBlank(90)}},
        // No blank point takes the place of the hole: the beam moves unblanked from 20 to 90.
        RenderingCase{
            "HoleInTheMiddleLeavesNoBlankPoint",
            {LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(20), Exposing(50), Exposing(55),
             Exposing(90), LeadBlank(90)},
            {LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(20), Exposing(90), LeadBlank(90)}},
        RenderingCase{"LeadInMovesToTheFirstKeptPoint",
                      {LeadBlank(50, 3), Asymmetry(50, 3), Exposing(50, 3), Exposing(45, 3), Exposing(70, 4),
                       LeadBlank(70, 4)},
                      {LeadBlank(70, 4), Asymmetry(70, 4), Exposing(70, 4), LeadBlank(70, 4)}},
        RenderingCase{
            "PostBlankingMovesToTheLastKeptPoint",
            {LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(30, 8), Exposing(50), LeadBlank(50)},
            {LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(30, 8), LeadBlank(30, 8)}},
        // Nothing was written before the post-blanking point, so nothing is left.
        RenderingCase{"AllInsideLeavesNothing",
                      {LeadBlank(50), Asymmetry(50), Exposing(50), Exposing(52), LeadBlank(52)},
                      {}},
        // PreBlankingTime 2e-6 s is 80 ticks at 2.5e-8 s: both blanking points are other points and go;
        // the asymmetry point (still 2 ticks) regenerates a default lead-in of 40 and 2 ticks.
        RenderingCase{"EightyTickBlankingPointsRemoved",
                      {MakePoint(10, 0, 80, PointFlag_Blank), Asymmetry(10), Exposing(10), Exposing(20),
                       MakePoint(20, 0, 80, PointFlag_Blank)},
                      {LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(20)}},
        // Without any start asymmetry the 80-tick lead-in disappears entirely.
        RenderingCase{"EightyTickBlankingWithoutAsymmetryLeavesOnlyExposingPoints",
                      {MakePoint(10, 0, 80, PointFlag_Blank), Exposing(10), Exposing(20),
                       MakePoint(20, 0, 80, PointFlag_Blank)},
                      {Exposing(10), Exposing(20)}},
        RenderingCase{"EmptyList", {}, {}}),
    [](const ::testing::TestParamInfo<RenderingCase>& param) { return param.param.name; });

struct ClassCase {
    std::string name;
    PatternPoint point;
    bool kept;
};

class PointClassTest : public ::testing::TestWithParam<ClassCase> {};

// Each point follows an exposing point at 10 so that a lead-in blank has a position to move to.
TEST_P(PointClassTest, KeptOrDropped) {
    const PatternPoint point = GetParam().point;
    const Points kept = Filter({Exposing(10), point}, InMiddleBand);
    ASSERT_EQ(kept.size(), GetParam().kept ? 2u : 1u);
    if (GetParam().kept) {
        EXPECT_EQ(kept[1].dwell, point.dwell);
        EXPECT_EQ(kept[1].flags, point.flags);
        EXPECT_EQ(kept[1].reserved, point.reserved);
    }
}

INSTANTIATE_TEST_SUITE_P(
    Cases, PointClassTest,
    ::testing::Values(
        ClassCase{"ExposingWithSyncBit", MakePoint(20, 0, 7, PointFlag_Acquire | PointFlag_Sync), true},
        ClassCase{"LeadBlankWithSyncBit", MakePoint(20, 0, 40, PointFlag_Blank | PointFlag_Sync), true},
        ClassCase{"BlankOf39Ticks", MakePoint(20, 0, 39, PointFlag_Blank), false},
        ClassCase{"BlankOf41Ticks", MakePoint(20, 0, 41, PointFlag_Blank), false},
        ClassCase{"AcquireAndBlank", MakePoint(20, 0, 40, PointFlag_Acquire | PointFlag_Blank), false},
        ClassCase{"FlaglessOf3Ticks", MakePoint(20, 0, 3, 0), false},
        ClassCase{"SyncOnlyOf3Ticks", MakePoint(20, 0, 3, PointFlag_Sync), false},
        // A start asymmetry is never written itself; it only makes the lead-in pending.
        ClassCase{"StartAsymmetry", Asymmetry(20), false}),
    [](const ::testing::TestParamInfo<ClassCase>& param) { return param.param.name; });

TEST(PointFilterTest, LeadBlankKeepsItsOwnFieldsAtTheLastPosition) {
    PatternPoint blank = MakePoint(90, 90, 40, PointFlag_Blank | PointFlag_Sync);
    blank.reserved = 5;
    PatternPoint expected = blank;
    expected.x = 10;
    expected.y = 11;
    EXPECT_EQ(Filter({Exposing(10, 11), blank}, InMiddleBand), (Points{Exposing(10, 11), expected}));
}

TEST(PointFilterTest, LeadBlankWhilePendingCancelsTheLeadIn) {
    EXPECT_EQ(Filter({LeadBlank(10), Asymmetry(10), LeadBlank(10), Exposing(20)}, InMiddleBand),
              (Points{Exposing(20)}));
}

// A list without the leading blank point leaves room only for the asymmetry point in front of the first
// kept point: the regenerated lead-in never overwrites a point not yet read nor runs past the list.
TEST(PointFilterTest, RegeneratedLeadInTakesOnlyTheRoomOfDroppedPoints) {
    EXPECT_EQ(Filter({Asymmetry(10), Exposing(10)}, InMiddleBand), (Points{Asymmetry(10), Exposing(10)}));
    EXPECT_EQ(Filter({Exposing(10), Asymmetry(20), Exposing(20), Exposing(30)}, InMiddleBand),
              (Points{Exposing(10), Asymmetry(20), Exposing(20), Exposing(30)}));
    // One dropped point inside the band makes room for the blank point as well.
    EXPECT_EQ(Filter({Exposing(10), Asymmetry(20), Exposing(50), Exposing(30)}, InMiddleBand),
              (Points{Exposing(10), LeadBlank(30), Asymmetry(30), Exposing(30)}));
}

// Two passes back to back, each framed by its own lead-in and post-blanking point, with nothing inside:
// the second pass's leading blank point follows the last written point (the first pass's end at 20), and
// its asymmetry point is regenerated in place; everything else is as it was.
TEST(PointFilterTest, ConsecutivePassesOutside) {
    const Points passes{LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(20), LeadBlank(20),
                        LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(20), LeadBlank(20)};
    Points expected = passes;
    expected[5] = LeadBlank(20);
    EXPECT_EQ(Filter(passes, InMiddleBand), expected);
}

// DAC 10 with offset 40 is tested at 50 (inside) and dropped; DAC 30 is tested at 70 and kept with its
// stored position.
TEST(PointFilterTest, OffsetsOnlyMoveTheContainmentTest) {
    EXPECT_EQ(
        Filter({LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(30), LeadBlank(30)}, InMiddleBand, 40),
        (Points{LeadBlank(30), Asymmetry(30), Exposing(30), LeadBlank(30)}));
    // The Y offset moves only Y: a band in y from 0.45 to 0.55.
    const ContainsFunction inYBand = [](coordinate<double> p) { return p.y >= 0.45 && p.y <= 0.55; };
    EXPECT_EQ(Filter({Exposing(50, 5), Exposing(50, 20)}, inYBand, 0, 45), (Points{Exposing(50, 20)}));
}

// 65535 + 65535 = 131070 in 32 bits is relative 1.0 on a 0..131070 field; wrapped to 16 bits it would be
// 65534, about 0.5.
TEST(PointFilterTest, OffsetSumDoesNotWrap) {
    const ContainsFunction atRightEdge = [](coordinate<double> p) { return p.x == 1.0; };
    EXPECT_TRUE(Filter({Exposing(65535)}, atRightEdge, 65535, 0, {}, RangeInt{0, 131070}).empty());
}

// Relative x = (X − minimum) / (maximum − minimum): DAC 30 on 10..50 is 0.5.
TEST(PointFilterTest, RelativePositionUsesTheShapeRange) {
    const ContainsFunction atHalf = [](coordinate<double> p) { return p.x == 0.5 && p.y == 0.25; };
    EXPECT_TRUE(Filter({Exposing(30, 20)}, atHalf, 0, 0, {}, RangeInt{10, 50}).empty());
}

// The shape matrix (shape to field) shifts by 0.5 in x, so the field band 0.5..0.6 is the shape's 0..0.1.
TEST(PointFilterTest, PointsAreMappedThroughTheInverseMatrix) {
    const ContainsFunction nearOrigin = [](coordinate<double> p) { return p.x >= 0.0 && p.x <= 0.1; };
    const TransformationMatrix shift{.m2 = 0.5};
    EXPECT_EQ(Filter({Exposing(5), Exposing(55), Exposing(65)}, nearOrigin, 0, 0, shift),
              (Points{Exposing(5), Exposing(65)}));
    // Scaled by 2 in y: field y 0.5 is shape y 0.25.
    const ContainsFunction atQuarter = [](coordinate<double> p) { return p.y == 0.25; };
    EXPECT_EQ(Filter({Exposing(0, 50), Exposing(0, 25)}, atQuarter, 0, 0, TransformationMatrix{.m4 = 2.0}),
              (Points{Exposing(0, 25)}));
}

TEST(PointFilterTest, SingularMatrixFailsOnlyWithAnExposingPoint) {
    const TransformationMatrix singular{.m0 = 0.0, .m4 = 0.0};
    EXPECT_TRUE(Filter({LeadBlank(10), Asymmetry(10), LeadBlank(10)}, InMiddleBand, 0, 0, singular).empty());
    try {
        Filter({LeadBlank(10), Asymmetry(10), Exposing(10), LeadBlank(10)}, InMiddleBand, 0, 0, singular);
        FAIL() << "a singular matrix was inverted";
    } catch (const std::exception& error) {
        EXPECT_STREQ(error.what(), "matrix inverse does not exist");
    }
}

// An obviously correct filter written the other way round: it builds a new list instead of compacting in
// place. The room for a regenerated lead-in is the number of points read so far minus those written.
Points ReferenceFilter(const Points& input, const ContainsFunction& contains, std::uint16_t offsetX,
                       std::uint16_t offsetY, const TransformationMatrix& matrix) {
    const TransformationMatrix inverse = InvertMatrix(matrix);
    const auto inside = [&](const PatternPoint& p) {
        const double x = (p.x + offsetX) / 100.0;
        const double y = (p.y + offsetY) / 100.0;
        return contains(
            {inverse.m0 * x + inverse.m1 * y + inverse.m2, inverse.m3 * x + inverse.m4 * y + inverse.m5});
    };
    Points output;
    bool pending = false;
    for (std::size_t i = 0; i < input.size(); ++i) {
        const PatternPoint& p = input[i];
        const bool acquire = (p.flags & PointFlag_Acquire) != 0;
        const bool blank = (p.flags & PointFlag_Blank) != 0;
        if (acquire && !blank && !inside(p)) {
            if (pending && i - output.size() >= 2)
                output.push_back(MakePoint(p.x, p.y, 40, PointFlag_Blank));
            if (pending)
                output.push_back(MakePoint(p.x, p.y, 2, 0));
            pending = false;
            output.push_back(p);
        } else if (blank && !acquire && p.dwell == 40) {
            if (!pending && !output.empty()) {
                PatternPoint moved = p;
                moved.x = output.back().x;
                moved.y = output.back().y;
                output.push_back(moved);
            }
            pending = false;
        } else if (!blank && !acquire && p.dwell == 2) {
            pending = true;
        }
    }
    return output;
}

PatternPoint RandomPoint(std::mt19937& random) {
    std::uniform_int_distribution<int> position(0, 100);
    const auto x = static_cast<std::uint16_t>(position(random));
    const auto y = static_cast<std::uint16_t>(position(random));
    static constexpr std::uint8_t kFlags[] = {0,
                                              PointFlag_Acquire,
                                              PointFlag_Blank,
                                              PointFlag_Acquire | PointFlag_Blank,
                                              PointFlag_Acquire | PointFlag_Sync,
                                              PointFlag_Blank | PointFlag_Sync};
    static constexpr std::uint16_t kDwells[] = {2, 40, 1, 39, 80, 7};
    std::uniform_int_distribution<std::size_t> pick(0, 5);
    PatternPoint point = MakePoint(x, y, kDwells[pick(random)], kFlags[pick(random)]);
    point.reserved = static_cast<std::uint8_t>(pick(random));
    return point;
}

TEST(PointFilterTest, MatchesTheReferenceOnRandomLists) {
    std::mt19937 random(20240611);
    const ContainsFunction disc = [](coordinate<double> p) {
        return (p.x - 0.3) * (p.x - 0.3) + (p.y - 0.4) * (p.y - 0.4) <= 0.09;
    };
    const TransformationMatrix matrix{
        .m0 = 1.5, .m1 = 0.25, .m2 = -0.125, .m3 = -0.5, .m4 = 0.75, .m5 = 0.0625};
    std::uniform_int_distribution<std::size_t> length(0, 40);
    std::uniform_int_distribution<int> offset(0, 30);
    for (int round = 0; round < 3000; ++round) {
        Points input(length(random));
        for (PatternPoint& point : input)
            point = RandomPoint(random);
        const auto offsetX = static_cast<std::uint16_t>(offset(random));
        const auto offsetY = static_cast<std::uint16_t>(offset(random));
        ASSERT_EQ(Filter(input, disc, offsetX, offsetY, matrix),
                  ReferenceFilter(input, disc, offsetX, offsetY, matrix))
            << "round " << round;
    }
}

class PointListFilterTest : public ::testing::Test {
  protected:
    static CComPtr<IPatternPointList> MakeList(const Points& points) {
        auto list =
            Norvane::CComObjectEx<Norvane::Dwellmap::CPatternPointList>::CreateInstance<IPatternPointList>();
        EXPECT_EQ(list->SetCount(static_cast<std::uint32_t>(points.size())), S_OK);
        const PointBufferView view(list);
        std::copy(points.begin(), points.end(), view.Points().begin());
        return list;
    }

    static Points PointsOf(IPatternPointList* list) {
        const PointBufferView view(list);
        return {view.Points().begin(), view.Points().end()};
    }

    ContainsFunction band_ = InMiddleBand;
    ShapeView shape_{.matrix = {}, .rangeX = kField, .rangeY = kField, .contains = &band_};
};

TEST_F(PointListFilterTest, ListIsShortenedToTheKeptPoints) {
    const auto list =
        MakeList({LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(50), Exposing(90), LeadBlank(90)});
    FilterPointList(list, 0, 0, shape_);
    EXPECT_EQ(PointsOf(list),
              (Points{LeadBlank(10), Asymmetry(10), Exposing(10), Exposing(90), LeadBlank(90)}));
}

TEST_F(PointListFilterTest, NullListIsRefused) {
    try {
        FilterPointList(nullptr, 0, 0, shape_);
        FAIL() << "a null list was accepted";
    } catch (const Norvane::HResultException& error) {
        EXPECT_EQ(error.Error(), E_INVALIDARG);
        EXPECT_EQ(error.Description(), u"Null arguments supplied");
    }
}

} // namespace

#include "composition/shape_test_support.h"

#include "core/pattern_base.h"
#include "core/point_buffer_view.h"

#include <algorithm>
#include <cstdint>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

using namespace shape_testing;

using Points = std::vector<PatternPoint>;

PatternPoint Blank(std::uint16_t x, std::uint16_t y) {
    return MakePoint(x, y, 40, PointFlag_Blank);
}
PatternPoint Asymmetry(std::uint16_t x, std::uint16_t y) {
    return MakePoint(x, y, 2, 0);
}
PatternPoint Exposing(std::uint16_t x, std::uint16_t y) {
    return MakePoint(x, y, 9, PointFlag_Acquire);
}

CComPtr<IPatternPointList> MakeList(const Points& points) {
    CComPtr<IPatternPointList> list = CreatePointList(static_cast<std::uint32_t>(points.size()));
    PointBufferView view(list);
    std::copy(points.begin(), points.end(), view.Points().begin());
    return list;
}

Points ListPoints(IPatternPointList* list) {
    if (PointCount(list) == 0)
        return {};
    PointBufferView view(list);
    return {view.Points().begin(), view.Points().end()};
}

// A rendering as a pattern lays it: lead-in blank and asymmetry at the first point, exposing points at
// DAC x 10, 20, ..., 90 on row y 50, and the post-blanking point at the last one.
Points RenderedRow() {
    Points points{Blank(10, 50), Asymmetry(10, 50)};
    for (std::uint16_t x = 10; x <= 90; x += 10)
        points.push_back(Exposing(x, 50));
    points.push_back(Blank(90, 50));
    return points;
}

class ShapeFilterTest : public ShapesTest {
  protected:
    // Shapes here see a DAC field of 0..100 on both axes, so DAC 40 is relative 0.4 exactly as
    // double(40) / double(100) rounds to the same value as the literal.
    static CComPtr<IShape> OnSmallField(IUnknown* shape) {
        auto result = QueryAs<IShape>(shape);
        SetFrame(result, {}, {0, 100}, {0, 100});
        return result;
    }
    static Points Filtered(IShape* shape, const Points& points, std::uint16_t offsetX = 0,
                           std::uint16_t offsetY = 0) {
        auto list = MakeList(points);
        auto filter = QueryAs<IPatternPointFilter>(shape);
        EXPECT_EQ(offsetX == 0 && offsetY == 0 ? filter->FilterList(list)
                                               : filter->FilterListWithOffset(list, offsetX, offsetY),
                  S_OK);
        return ListPoints(list);
    }
};

// Rectangle x 0.4..0.6: DAC 40, 50 and 60 are inside (two of them on its edges) and vanish; the
// beam moves unblanked from 30 to 70.
TEST_F(ShapeFilterTest, RectangleRemovesTheExposingPointsItContainsEdgesIncluded) {
    auto shape = OnSmallField(NewRectangle({0.4, 0.0, 0.6, 1.0}));
    const Points expected{Blank(10, 50),    Asymmetry(10, 50), Exposing(10, 50),
                          Exposing(20, 50), Exposing(30, 50),  Exposing(70, 50),
                          Exposing(80, 50), Exposing(90, 50),  Blank(90, 50)};
    EXPECT_EQ(Filtered(shape, RenderedRow()), expected);
}

// Removing the first and the last points moves the lead-in to the first kept point (x 30) and the
// post-blanking point to the last kept one (x 70).
TEST_F(ShapeFilterTest, LeadInAndPostBlankingFollowTheKeptPoints) {
    auto polygon = NewPolygon({{0.0, 0.0}, {0.25, 0.0}, {0.25, 1.0}, {0.0, 1.0}});
    auto left = OnSmallField(polygon);
    auto right = OnSmallField(NewCircle({1.0, 0.5}, 0.0, 0.25));
    const Points once = Filtered(left, RenderedRow());
    const Points expected{Blank(30, 50),    Asymmetry(30, 50), Exposing(30, 50), Exposing(40, 50),
                          Exposing(50, 50), Exposing(60, 50),  Exposing(70, 50), Blank(70, 50)};
    EXPECT_EQ(Filtered(right, once), expected);
}

// The offsets move the tested position only: points stored at x 10..30 are tested at 40..60.
TEST_F(ShapeFilterTest, OffsetsShiftTheTestedPositionButNotTheStoredOne) {
    auto shape = OnSmallField(NewRectangle({0.4, 0.0, 0.6, 1.0}));
    const Points expected{Blank(40, 50),    Asymmetry(40, 50), Exposing(40, 50),
                          Exposing(50, 50), Exposing(60, 50),  Exposing(70, 50),
                          Exposing(80, 50), Exposing(90, 50),  Blank(90, 50)};
    EXPECT_EQ(Filtered(shape, RenderedRow(), 30, 0), expected);
    EXPECT_EQ(Filtered(shape, RenderedRow(), 0, 60), RenderedRow()) << "y 110 is below the rectangle";
}

// The matrix moves the shape by +0.3 in x: its rectangle x 0.05..0.35 covers field x 0.35..0.65.
TEST_F(ShapeFilterTest, PointsAreMappedThroughTheInverseMatrix) {
    auto shape = OnSmallField(NewRectangle({0.05, 0.0, 0.35, 1.0}));
    EXPECT_EQ(shape->put_TransformationMatrix(CreateMatrix({1.0, 0.0, 0.3, 0.0, 1.0, 0.0})), S_OK);
    const Points expected{Blank(10, 50),    Asymmetry(10, 50), Exposing(10, 50),
                          Exposing(20, 50), Exposing(30, 50),  Exposing(70, 50),
                          Exposing(80, 50), Exposing(90, 50),  Blank(90, 50)};
    EXPECT_EQ(Filtered(shape, RenderedRow()), expected);
}

// Rows in line with the square's top and bottom edges (y 0.4 and 0.6) pass beside it: the points left and
// right of the square stay, the lead-in and lead-out included.
TEST_F(ShapeFilterTest, PolygonKeepsPointsInLineWithItsHorizontalEdges) {
    auto shape = OnSmallField(NewPolygon({{0.4, 0.4}, {0.6, 0.4}, {0.6, 0.6}, {0.4, 0.6}}));
    for (std::uint16_t y : {40, 60}) {
        SCOPED_TRACE(y);
        const Points row{Blank(10, y),    Asymmetry(10, y), Exposing(10, y), Exposing(30, y),
                         Exposing(70, y), Exposing(90, y),  Blank(90, y)};
        EXPECT_EQ(Filtered(shape, row), row);
    }
}

// With the default field of 0..65535 on both axes nothing of the row lies in a circle around the
// field's corner, and the filtered list is the rendering unchanged.
TEST_F(ShapeFilterTest, ShapeMissingEveryPointLeavesTheRenderingUnchanged) {
    auto shape = QueryAs<IShape>(NewCircle({1.0, 1.0}, 0.0, 0.5).Get());
    EXPECT_EQ(Filtered(shape, RenderedRow()), RenderedRow());
}

// Relative coordinates are taken per axis: on a field twice as high as wide, the circle of radius 0.25
// around (0.5, 0.5) reaches 25 DAC units sideways but 50 up and down.
TEST_F(ShapeFilterTest, CircleIsAnEllipseInDacTermsOnUnequalRanges) {
    auto shape = QueryAs<IShape>(NewCircle({0.5, 0.5}, 0.0, 0.25).Get());
    SetFrame(shape, {}, {0, 100}, {0, 200});
    const Points column{Exposing(75, 100), Exposing(76, 100), Exposing(50, 150), Exposing(50, 151)};
    EXPECT_EQ(Filtered(shape, column), (Points{Exposing(76, 100), Exposing(50, 151)}));
}

TEST_F(ShapeFilterTest, SingularMatrixIsStoredButFailsTheFilter) {
    for (const ShapeKind& kind : kKinds) {
        SCOPED_TRACE(kind.name);
        auto shape = CreateInstance<IShape>(kind.clsid);
        EXPECT_EQ(shape->put_TransformationMatrix(CreateMatrix({1.0, 2.0, 0.0, 2.0, 4.0, 0.0})), S_OK);
        auto list = MakeList(RenderedRow());
        ExpectFailure(QueryAs<IPatternPointFilter>(shape.Get())->FilterList(list),
                      {E_FAIL, IID_IPatternPointFilter, u"matrix inverse does not exist"});
    }
}

} // namespace
} // namespace Norvane::Lumis::Scanning

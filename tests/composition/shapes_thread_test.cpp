#include "composition/shape_test_support.h"

#include "core/pattern_base.h"
#include "core/point_buffer_view.h"

#include <thread>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

using namespace shape_testing;

// Two shapes copied into each other on two threads at once: neither copy may wait for the other.
TEST_F(ShapesTest, CrossedCopiesBetweenTwoShapesFinish) {
    auto first = QueryAs<IShape>(NewRectangle({0.1, 0.1, 0.2, 0.2}).Get());
    auto second = QueryAs<IShape>(NewRectangle({0.3, 0.3, 0.4, 0.4}).Get());
    auto copyMany = [](IShape* from, IShape* to) {
        for (int i = 0; i < 200; ++i)
            EXPECT_EQ(from->CopyTo(to), S_OK);
    };
    std::thread one(copyMany, first.Get(), second.Get());
    std::thread two(copyMany, second.Get(), first.Get());
    one.join();
    two.join();
}

// Filtering on one thread while another changes the circle's radii and matrix: each containment test
// reads a consistent set of fields.
TEST_F(ShapesTest, FilteringWhilePropertiesChangeIsSafe) {
    auto circle = NewCircle({0.5, 0.5}, 0.0, 0.25);
    auto shape = QueryAs<IShape>(circle.Get());
    auto filter = QueryAs<IPatternPointFilter>(circle.Get());
    std::thread writer([&] {
        for (int i = 0; i < 200; ++i) {
            EXPECT_EQ(circle->put_OuterRadius((i % 10) / 10.0), S_OK);
            EXPECT_EQ(circle->put_InnerRadius((i % 3) / 10.0), S_OK);
            EXPECT_EQ(shape->put_DACRangeX(CreateRange({0, 1000 + i})), S_OK);
        }
    });
    for (int i = 0; i < 200; ++i) {
        CComPtr<IPatternPointList> list = CreatePointList(16);
        {
            PointBufferView view(list);
            for (std::uint16_t k = 0; k < 16; ++k)
                view.Points()[k] =
                    MakePoint(static_cast<std::uint16_t>(k * 4000), 32768, 5, PointFlag_Acquire);
        }
        EXPECT_EQ(filter->FilterList(list), S_OK);
    }
    writer.join();
}

} // namespace
} // namespace Norvane::Lumis::Scanning

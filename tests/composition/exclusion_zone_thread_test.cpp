#include "composition/exclusion_shape_classes.h"
#include "composition/exclusion_zone_classes.h"
#include "core/point_buffer_view.h"
#include "dwellmap/pattern_point_list.h"
#include "module/class_table.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"

#include <beamweaver/exclusion.h>
#include <beamweaver/pattern.h>

#include <gtest/gtest.h>

#include <thread>
#include <vector>

using namespace Norvane::Lumis;
using namespace Norvane::Lumis::Scanning;

namespace {

CComPtr<IShape> RightHalf() {
    const auto rectangle = Norvane::CreateInstance<IShapeRectangle>(CLSID_ShapeRectangle);
    EXPECT_EQ(rectangle->put_Rectangle(
                  CreateRectangleFloat({.left = 0.5, .top = 0.0, .right = 1.0, .bottom = 1.0})),
              S_OK);
    return QueryAs<IShape>(rectangle.Get());
}

// Exposing points at x = 0 (kept by every right-half shape) and x = 65535 (removed by any).
CComPtr<IPatternPointList> TwoPointList() {
    auto list =
        Norvane::CComObjectEx<Norvane::Dwellmap::CPatternPointList>::CreateInstance<IPatternPointList>();
    EXPECT_EQ(list->SetCount(2), S_OK);
    const PointBufferView view(list);
    view.Points()[0] = MakePoint(0, 0, 7, PointFlag_Acquire);
    view.Points()[1] = MakePoint(65535, 0, 7, PointFlag_Acquire);
    return list;
}

// Two threads filter through one zone while two others add and remove shapes of their own: the lock
// serialises them, and every pass sees a consistent array. The zone always holds one right-half shape,
// so every filtered list keeps exactly the left point.
TEST(ExclusionZoneThreadTest, FilteringWhileShapesComeAndGo) {
    RegisterComponents();
    RegisterClasses(ExclusionZoneClassEntries());
    RegisterClasses(ExclusionShapeClassEntries());
    const auto zone = Norvane::CreateInstance<IExclusionZone>(CLSID_ExclusionZone);
    ASSERT_EQ(zone->AddShape(RightHalf()), S_OK);
    const auto filter = QueryAs<IPatternPointFilter>(zone.Get());
    constexpr int kRounds = 200;

    std::vector<std::thread> threads;
    for (int t = 0; t < 2; ++t) {
        threads.emplace_back([&] {
            for (int i = 0; i < kRounds; ++i) {
                const auto list = TwoPointList();
                EXPECT_EQ(filter->FilterListWithOffset(list, 0, 0), S_OK);
                EXPECT_EQ(PointCount(list), 1u);
            }
        });
        threads.emplace_back([&] {
            const auto shape = RightHalf();
            for (int i = 0; i < kRounds; ++i) {
                EXPECT_EQ(zone->AddShape(shape), S_OK);
                VARIANT_BOOL contained = VARIANT_FALSE;
                EXPECT_EQ(zone->ContainsShape(shape, &contained), S_OK);
                EXPECT_EQ(contained, VARIANT_TRUE);
                EXPECT_EQ(zone->RemoveShape(shape), S_OK);
            }
        });
    }
    for (std::thread& thread : threads)
        thread.join();
}

} // namespace

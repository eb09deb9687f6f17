#include "dwellmap_test_support.h"

#include "comtypes/comtypes_registration.h"
#include "module/geometry_io.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

using namespace dwellmap_test;

namespace {

struct Placement {
    std::int32_t value;
    std::uint16_t offsetX;
    std::uint16_t offsetY;
    std::uint32_t repeatCount;
};

Placement PlacementOf(ISubPattern* item) {
    Placement placement{};
    EXPECT_EQ(item->get_Value(&placement.value), S_OK);
    EXPECT_EQ(item->get_OffsetX(&placement.offsetX), S_OK);
    EXPECT_EQ(item->get_OffsetY(&placement.offsetY), S_OK);
    EXPECT_EQ(item->get_RepeatCount(&placement.repeatCount), S_OK);
    return placement;
}

CComPtr<ISubPattern> ItemOf(ISubPatternCollection* collection, std::int32_t index) {
    CComPtr<ISubPattern> item;
    EXPECT_EQ(collection->Item(index, &item), S_OK);
    return item;
}

CComPtr<IPatternPointList> ListOfItem(ISubPattern* item) {
    CComPtr<IPatternPointList> list;
    EXPECT_EQ(item->get_PointList(&list), S_OK);
    return list;
}

struct DwellSummary {
    std::uint16_t minimum;
    std::uint16_t maximum;
    std::uint32_t total;
    friend bool operator==(const DwellSummary&, const DwellSummary&) = default;
};

DwellSummary SummaryOf(ISubPatternCollection* collection) {
    DwellSummary summary{};
    EXPECT_EQ(collection->get_MinimumDwellTicks(&summary.minimum), S_OK);
    EXPECT_EQ(collection->get_MaximumDwellTicks(&summary.maximum), S_OK);
    EXPECT_EQ(collection->get_TotalPointCount(&summary.total), S_OK);
    return summary;
}

void ExpectPlacement(ISubPattern* item, const Placement& expected) {
    const Placement actual = PlacementOf(item);
    EXPECT_EQ(actual.value, expected.value);
    EXPECT_EQ(actual.offsetX, expected.offsetX);
    EXPECT_EQ(actual.offsetY, expected.offsetY);
    EXPECT_EQ(actual.repeatCount, expected.repeatCount);
}

} // namespace

TEST(SubPatternCollection, SubPatternsComeBackInAddingOrderWithTheirListsAndPlacement) {
    auto collection = NewCollection();
    auto first = ListOf(PointsWithDwells({1}));
    auto second = ListOf(PointsWithDwells({2, 3}));
    ASSERT_EQ(collection->Add(first, 7, 100, 200, 3), S_OK);
    ASSERT_EQ(collection->Add(second, -5, 65535, 0, 0xFFFFFFFFu), S_OK);

    std::int32_t count = 0;
    ASSERT_EQ(collection->get_Count(&count), S_OK);
    EXPECT_EQ(count, 2);
    auto item0 = ItemOf(collection, 0);
    auto item1 = ItemOf(collection, 1);
    ASSERT_TRUE(item0 && item1);
    EXPECT_EQ(ListOfItem(item0).Get(), first.Get());
    EXPECT_EQ(ListOfItem(item1).Get(), second.Get());
    ExpectPlacement(item0, {7, 100, 200, 3});
    ExpectPlacement(item1, {-5, 65535, 0, 0xFFFFFFFFu});
}

TEST(SubPatternCollection, ItemOutsideTheSubPatternsIsRefusedWithoutErrorInformation) {
    auto collection = NewCollection();
    ASSERT_EQ(collection->Add(ListOf(PointsWithDwells({1})), 0, 0, 0, 1), S_OK);
    for (std::int32_t index :
         {-1, 1, std::numeric_limits<std::int32_t>::min(), std::numeric_limits<std::int32_t>::max()}) {
        TakeErrorDescription();
        CComPtr<ISubPattern> item;
        EXPECT_EQ(collection->Item(index, &item), E_INVALIDARG) << index;
        EXPECT_FALSE(item);
        CComPtr<IErrorInfo> info;
        EXPECT_EQ(GetErrorInfo(0, &info), S_FALSE);
    }
    EXPECT_EQ(collection->Item(0, nullptr), E_POINTER);
}

TEST(SubPatternCollection, AddingANullListIsRefusedWithItsNameAndNothingIsAdded) {
    auto collection = NewCollection();
    TakeErrorDescription();
    EXPECT_EQ(collection->Add(nullptr, 0, 0, 0, 1), E_INVALIDARG);
    EXPECT_EQ(TakeErrorDescription(), u"pointList object is null");
    std::int32_t count = -1;
    ASSERT_EQ(collection->get_Count(&count), S_OK);
    EXPECT_EQ(count, 0);
}

// Dwells {5, 9, 3} and {12, 4}: the minimum 3 lies in the first list, the maximum 12 in the second;
// the lists hold 3 + 2 = 5 points.
TEST(SubPatternCollection, DwellTicksAndTotalSpanEveryPointOfEverySubPattern) {
    auto collection = NewCollection();
    ASSERT_EQ(collection->Add(ListOf(PointsWithDwells({5, 9, 3})), 0, 0, 0, 1), S_OK);
    ASSERT_EQ(collection->Add(ListOf(PointsWithDwells({12, 4})), 0, 10, 10, 4), S_OK);
    EXPECT_EQ(SummaryOf(collection), (DwellSummary{3, 12, 5}));
}

// A list added twice counts twice: 2 + 2 points.
TEST(SubPatternCollection, AListAddedTwiceCountsForEachSubPattern) {
    auto collection = NewCollection();
    auto list = ListOf(PointsWithDwells({0, 65535}));
    ASSERT_EQ(collection->Add(list, 0, 0, 0, 1), S_OK);
    ASSERT_EQ(collection->Add(list, 0, 0, 0, 1), S_OK);
    EXPECT_EQ(SummaryOf(collection), (DwellSummary{0, 65535, 4}));
}

TEST(SubPatternCollection, WithoutAnyPointTheDwellTicksAndTotalAreZero) {
    auto collection = NewCollection();
    EXPECT_EQ(SummaryOf(collection), (DwellSummary{0, 0, 0}));
    ASSERT_EQ(collection->Add(NewPointList(), 0, 0, 0, 1), S_OK);
    EXPECT_EQ(SummaryOf(collection), (DwellSummary{0, 0, 0}));
}

// Lists are held by reference: a list shortened after it was added is seen shortened.
TEST(SubPatternCollection, ReadsItsListsAsTheyAreNow) {
    auto collection = NewCollection();
    auto list = ListOf(PointsWithDwells({8, 2, 6}));
    ASSERT_EQ(collection->Add(list, 0, 0, 0, 1), S_OK);
    ASSERT_EQ(QueryAs<IPatternPointListCount>(list.Get())->SetPointCount(1), S_OK);
    EXPECT_EQ(SummaryOf(collection), (DwellSummary{8, 8, 1}));
}

TEST(SubPatternCollection, DwellTimeResolutionKeepsTheLastAcceptedValue) {
    auto collection = NewCollection();
    double resolution = -1.0;
    ASSERT_EQ(collection->get_DwellTimeResolution(&resolution), S_OK);
    EXPECT_EQ(resolution, 0.0);
    ASSERT_EQ(collection->put_DwellTimeResolution(4e-7), S_OK);
    for (double bad : {-1e-9, std::nan(""), std::numeric_limits<double>::infinity()})
        EXPECT_EQ(collection->put_DwellTimeResolution(bad), E_INVALIDARG) << bad;
    ASSERT_EQ(collection->get_DwellTimeResolution(&resolution), S_OK);
    EXPECT_EQ(resolution, 4e-7);
}

class SubPatternCollectionFieldOfView : public ::testing::Test {
  protected:
    void SetUp() override { RegisterComTypesClasses(); }

    static Norvane::Lumis::RectangleInt FieldOfViewOf(ISubPatternCollection* collection) {
        CComPtr<IRectangleInt> rectangle;
        EXPECT_EQ(collection->get_FieldOfView(&rectangle), S_OK);
        return Norvane::Lumis::ReadRectangleInt(rectangle);
    }
};

TEST_F(SubPatternCollectionFieldOfView, IsCopiedInAndHandedOutAsANewObject) {
    auto collection = NewCollection();
    EXPECT_EQ(FieldOfViewOf(collection), (Norvane::Lumis::RectangleInt{0, 0, 0, 0}));

    const Norvane::Lumis::RectangleInt range{16384, 16000, 49152, 50000};
    auto client = Norvane::Lumis::CreateRectangleInt(range);
    ASSERT_EQ(collection->put_FieldOfView(client), S_OK);
    ASSERT_EQ(client->put_Left(1), S_OK);
    EXPECT_EQ(FieldOfViewOf(collection), range);

    CComPtr<IRectangleInt> handedOut;
    ASSERT_EQ(collection->get_FieldOfView(&handedOut), S_OK);
    EXPECT_NE(handedOut.Get(), client.Get());
}

TEST_F(SubPatternCollectionFieldOfView, ANullRectangleIsRefusedWithItsNameAndTheOldValueKept) {
    auto collection = NewCollection();
    const Norvane::Lumis::RectangleInt range{0, 0, 65535, 65535};
    ASSERT_EQ(collection->put_FieldOfView(Norvane::Lumis::CreateRectangleInt(range)), S_OK);
    TakeErrorDescription();
    EXPECT_EQ(collection->put_FieldOfView(nullptr), E_INVALIDARG);
    EXPECT_EQ(TakeErrorDescription(), u"FieldOfView object is null");
    EXPECT_EQ(FieldOfViewOf(collection), range);
}

TEST(SubPatternCollection, NullOutPointersAreRefused) {
    auto collection = NewCollection();
    EXPECT_EQ(collection->get_Count(nullptr), E_POINTER);
    EXPECT_EQ(collection->get_DwellTimeResolution(nullptr), E_POINTER);
    EXPECT_EQ(collection->get_MinimumDwellTicks(nullptr), E_POINTER);
    EXPECT_EQ(collection->get_MaximumDwellTicks(nullptr), E_POINTER);
    EXPECT_EQ(collection->get_TotalPointCount(nullptr), E_POINTER);
    EXPECT_EQ(collection->get_FieldOfView(nullptr), E_POINTER);
}

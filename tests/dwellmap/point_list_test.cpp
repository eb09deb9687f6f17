#include "dwellmap_test_support.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cstring>

using namespace dwellmap_test;

namespace {

constexpr PatternPoint kZero = MakePoint(0, 0, 0, 0);
constexpr PatternPoint kWritten = MakePoint(1234, 4321, 77, PointFlag_Blank);

bool AllZero(std::span<const PatternPoint> points) {
    return std::all_of(points.begin(), points.end(), [](const PatternPoint& p) { return p == kZero; });
}

std::int32_t CountOf(IPatternPointList* list) {
    std::int32_t count = -1;
    EXPECT_EQ(list->GetCount(&count), S_OK);
    return count;
}

void Fill(IPatternPointList* list, PatternPoint value) {
    const auto buffer = BufferOf(list);
    const auto points = RangeOf(buffer, 0, static_cast<std::uint32_t>(CountOf(list)));
    std::fill(points.begin(), points.end(), value);
}

} // namespace

TEST(PatternPoint, MakePointLaysOutXYDwellFlagsAndAZeroReservedByteLittleEndian) {
    const PatternPoint point = MakePoint(0x0102, 0x0304, 0x0506, PointFlag_Sync | PointFlag_Acquire);
    std::array<unsigned char, 8> bytes{};
    std::memcpy(bytes.data(), &point, sizeof point);
    EXPECT_EQ(bytes, (std::array<unsigned char, 8>{0x02, 0x01, 0x04, 0x03, 0x06, 0x05, 0x81, 0x00}));
    EXPECT_EQ(point, (PatternPoint{0x0102, 0x0304, 0x0506, 0x81, 0}));
}

TEST(PatternPoint, StorePointOverwritesTheWholeRecordIncludingTheReservedByte) {
    PatternPoint stored{0xFFFF, 0xFFFF, 0xFFFF, 0xFF, 0xFF};
    StorePoint(&stored, MakePoint(7, 8, 9, PointFlag_Blank));
    EXPECT_EQ(stored, (PatternPoint{7, 8, 9, PointFlag_Blank, 0}));
}

TEST(PatternPointList, ANewListIsEmptyAndSetCountGivesZeroRecords) {
    auto list = NewPointList();
    EXPECT_EQ(CountOf(list), 0);
    ASSERT_EQ(list->SetCount(100000), S_OK);
    EXPECT_EQ(CountOf(list), 100000);
    EXPECT_TRUE(AllZero(ContentsOf(list)));
}

// Shrinking keeps the memory with the old records in it; growing again must clear them.
TEST(PatternPointList, RegrowingAfterAShrinkClearsTheRegrownTail) {
    auto list = NewPointList();
    ASSERT_EQ(list->SetCount(8), S_OK);
    Fill(list, kWritten);
    ASSERT_EQ(list->SetCount(3), S_OK);
    ASSERT_EQ(list->SetCount(8), S_OK);
    const auto points = ContentsOf(list);
    EXPECT_EQ(std::count(points.begin(), points.begin() + 3, kWritten), 3);
    EXPECT_TRUE(AllZero(std::span(points).subspan(3)));
}

TEST(PatternPointList, GrowingBeyondTheMemoryKeepsTheRecordsAndClearsTheTail) {
    auto list = NewPointList();
    ASSERT_EQ(list->SetCount(4), S_OK);
    Fill(list, kWritten);
    ASSERT_EQ(list->SetCount(200000), S_OK);
    const auto points = ContentsOf(list);
    EXPECT_EQ(std::count(points.begin(), points.begin() + 4, kWritten), 4);
    EXPECT_TRUE(AllZero(std::span(points).subspan(4)));
}

TEST(PatternPointList, EmptyingAndRefillingAListGivesZeroRecords) {
    auto list = NewPointList();
    ASSERT_EQ(list->SetCount(16), S_OK);
    Fill(list, kWritten);
    ASSERT_EQ(list->SetCount(0), S_OK);
    ASSERT_EQ(list->SetCount(64), S_OK);
    EXPECT_TRUE(AllZero(ContentsOf(list)));
}

// GetCount reports an int32, so counts above 2^31 - 1 cannot be held.
TEST(PatternPointList, CountsBeyondTheReportableRangeAreRefusedAndTheListKept) {
    auto list = NewPointList();
    ASSERT_EQ(list->SetCount(5), S_OK);
    EXPECT_EQ(list->SetCount(0x80000000u), E_INVALIDARG);
    EXPECT_EQ(list->SetCount(0xFFFFFFFFu), E_INVALIDARG);
    EXPECT_EQ(CountOf(list), 5);
}

TEST(PatternPointList, WritesThroughARangeAreTheListsContents) {
    auto list = NewPointList();
    ASSERT_EQ(list->SetCount(10), S_OK);
    {
        const auto buffer = BufferOf(list);
        RangeOf(buffer, 9, 10)[0] = kWritten;
    }
    {
        const auto buffer = BufferOf(list);
        RangeOf(buffer, 0, 1)[0] = MakePoint(1, 2, 3, PointFlag_Acquire);
    }
    const auto points = ContentsOf(list);
    EXPECT_EQ(points[0], MakePoint(1, 2, 3, PointFlag_Acquire));
    EXPECT_EQ(points[9], kWritten);
    EXPECT_TRUE(AllZero(std::span(points).subspan(1, 8)));
}

struct RangeCase {
    std::uint32_t first;
    std::uint32_t last;
    HRESULT expected;
};

class PointBufferRange : public ::testing::TestWithParam<RangeCase> {};

TEST_P(PointBufferRange, CoversFirstToLastWithinTheCount) {
    const RangeCase c = GetParam();
    auto list = NewPointList();
    ASSERT_EQ(list->SetCount(10), S_OK);
    auto buffer = BufferOf(list);
    PatternPoint* base = nullptr;
    PatternPoint* baseEnd = nullptr;
    ASSERT_EQ(buffer->GetRange(0, 10, &base, &baseEnd), S_OK);
    PatternPoint* begin = nullptr;
    PatternPoint* end = nullptr;
    EXPECT_EQ(buffer->GetRange(c.first, c.last, &begin, &end), c.expected);
    if (c.expected == S_OK) {
        EXPECT_EQ(begin, base + c.first);
        EXPECT_EQ(end, base + c.last);
    }
}

INSTANTIATE_TEST_SUITE_P(Bounds, PointBufferRange,
                         ::testing::Values(RangeCase{0, 10, S_OK}, RangeCase{3, 7, S_OK},
                                           RangeCase{5, 5, S_OK}, RangeCase{10, 10, S_OK},
                                           RangeCase{4, 3, E_INVALIDARG}, RangeCase{0, 11, E_INVALIDARG},
                                           RangeCase{11, 11, E_INVALIDARG},
                                           RangeCase{0, 0xFFFFFFFFu, E_INVALIDARG}));

TEST(PatternPointList, NullOutPointersAreRefused) {
    auto list = NewPointList();
    auto buffer = BufferOf(list);
    PatternPoint* point = nullptr;
    EXPECT_EQ(list->GetCount(nullptr), E_POINTER);
    EXPECT_EQ(list->GetPointBuffer(nullptr), E_POINTER);
    EXPECT_EQ(buffer->GetRange(0, 0, nullptr, &point), E_POINTER);
    EXPECT_EQ(buffer->GetRange(0, 0, &point, nullptr), E_POINTER);
}

// The range must stay valid until the buffer goes: the buffer holds the list.
TEST(PatternPointList, ABufferKeepsItsListAlive) {
    auto list = NewPointList();
    ASSERT_EQ(list->SetCount(3), S_OK);
    auto buffer = BufferOf(list);
    list.Release();
    auto points = RangeOf(buffer, 0, 3);
    points[2] = kWritten;
    EXPECT_EQ(points[2], kWritten);
}

// Moving the records would leave the buffer's ranges pointing at freed memory.
TEST(PatternPointList, GrowingBeyondTheMemoryWhileABufferLivesIsRefusedAndTheListKept) {
    auto list = NewPointList();
    ASSERT_EQ(list->SetCount(4), S_OK);
    Fill(list, kWritten);
    {
        auto buffer = BufferOf(list);
        const auto before = RangeOf(buffer, 0, 4);
        TakeErrorDescription();
        EXPECT_EQ(list->SetCount(5), E_FAIL);
        EXPECT_NE(TakeErrorDescription().find(u"point buffer is in use"), std::u16string::npos);
        EXPECT_EQ(CountOf(list), 4);
        EXPECT_EQ(RangeOf(buffer, 0, 4).data(), before.data());
        ASSERT_EQ(list->SetCount(2), S_OK);
        ASSERT_EQ(list->SetCount(4), S_OK);
        EXPECT_TRUE(AllZero(RangeOf(buffer, 2, 4)));
    }
    EXPECT_EQ(list->SetCount(5), S_OK);
}

TEST(PatternPointListCount, ShortensTheListInPlaceKeepingTheFirstRecords) {
    auto list = ListOf(PointsWithDwells({1, 2, 3, 4, 5}));
    auto counter = QueryAs<IPatternPointListCount>(list.Get());
    ASSERT_TRUE(counter);
    auto buffer = BufferOf(list);
    const PatternPoint* before = RangeOf(buffer, 0, 5).data();
    ASSERT_EQ(counter->SetPointCount(3), S_OK);
    EXPECT_EQ(ContentsOf(list), PointsWithDwells({1, 2, 3}));
    EXPECT_EQ(RangeOf(buffer, 0, 3).data(), before);
    EXPECT_EQ(counter->SetPointCount(3), S_OK);
    EXPECT_EQ(counter->SetPointCount(0), S_OK);
    EXPECT_EQ(CountOf(list), 0);
}

TEST(PatternPointListCount, ACountAboveTheCurrentOneIsRefused) {
    auto list = ListOf(PointsWithDwells({1, 2, 3}));
    auto counter = QueryAs<IPatternPointListCount>(list.Get());
    ASSERT_TRUE(counter);
    EXPECT_EQ(counter->SetPointCount(4), E_INVALIDARG);
    EXPECT_EQ(ContentsOf(list), PointsWithDwells({1, 2, 3}));
}

// Test helpers: new point lists and collections, lists filled with given records, error descriptions.
#pragma once

#include "dwellmap/pattern_point_list.h"
#include "dwellmap/sub_pattern_collection.h"
#include "platform/error_info.h"

#include <beamweaver/dwellmap.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <initializer_list>
#include <span>
#include <string>
#include <vector>

namespace dwellmap_test {

inline CComPtr<IPatternPointList> NewPointList() {
    return Norvane::CComObjectEx<Norvane::Dwellmap::CPatternPointList>::CreateInstance<IPatternPointList>();
}

inline CComPtr<ISubPatternCollection> NewCollection() {
    return Norvane::CComObjectEx<Norvane::Dwellmap::CSubPatternCollection>::CreateInstance<
        ISubPatternCollection>();
}

inline CComPtr<IPatternPointBuffer> BufferOf(IPatternPointList* list) {
    CComPtr<IPatternPointBuffer> buffer;
    EXPECT_EQ(list->GetPointBuffer(&buffer), S_OK);
    return buffer;
}

// Records [first, last) of a buffer; empty when GetRange refuses.
inline std::span<PatternPoint> RangeOf(IPatternPointBuffer* buffer, std::uint32_t first, std::uint32_t last) {
    PatternPoint* begin = nullptr;
    PatternPoint* end = nullptr;
    EXPECT_EQ(buffer->GetRange(first, last, &begin, &end), S_OK);
    return begin == nullptr ? std::span<PatternPoint>() : std::span<PatternPoint>(begin, end);
}

inline std::vector<PatternPoint> ContentsOf(IPatternPointList* list) {
    std::int32_t count = 0;
    EXPECT_EQ(list->GetCount(&count), S_OK);
    const auto buffer = BufferOf(list);
    const auto points = RangeOf(buffer, 0, static_cast<std::uint32_t>(count));
    return {points.begin(), points.end()};
}

inline CComPtr<IPatternPointList> ListOf(const std::vector<PatternPoint>& points) {
    auto list = NewPointList();
    EXPECT_EQ(list->SetCount(static_cast<std::uint32_t>(points.size())), S_OK);
    const auto buffer = BufferOf(list);
    const auto range = RangeOf(buffer, 0, static_cast<std::uint32_t>(points.size()));
    std::copy(points.begin(), points.end(), range.begin());
    return list;
}

inline std::vector<PatternPoint> PointsWithDwells(std::initializer_list<std::uint16_t> dwells) {
    std::vector<PatternPoint> points;
    for (std::uint16_t dwell : dwells)
        points.push_back(MakePoint(100, 200, dwell, PointFlag_Acquire));
    return points;
}

// Takes the thread's error information; an empty string when there is none.
inline std::u16string TakeErrorDescription() {
    CComPtr<IErrorInfo> info;
    if (GetErrorInfo(0, &info) != S_OK)
        return {};
    CComBSTR description;
    info->GetDescription(&description);
    return std::u16string(description.View());
}

} // namespace dwellmap_test

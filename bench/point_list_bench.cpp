// Sizing a fresh point list and writing every record, against the floor of the same work: writing
// 8-byte records into a fresh calloc'd block. Both report points per second.
#include "dwellmap/pattern_point_list.h"

#include <benchmark/benchmark.h>

#include <cstdint>
#include <cstdlib>

namespace {

constexpr std::uint32_t kPoints = 10'000'000;

// A record that changes with every index, composed whole and stored with one write.
PatternPoint PointFor(std::uint32_t i) {
    return MakePoint(static_cast<std::uint16_t>(i), static_cast<std::uint16_t>(i >> 16),
                     static_cast<std::uint16_t>(i & 0xFFF), PointFlag_Acquire);
}

void WriteRecords(PatternPoint* points, std::uint32_t count) {
    for (std::uint32_t i = 0; i < count; ++i)
        StorePoint(points + i, PointFor(i));
}

void BM_PointListSizedAndWritten(benchmark::State& state) {
    for (auto _ : state) {
        auto list =
            Norvane::CComObjectEx<Norvane::Dwellmap::CPatternPointList>::CreateInstance<IPatternPointList>();
        CComPtr<IPatternPointBuffer> buffer;
        PatternPoint* begin = nullptr;
        PatternPoint* end = nullptr;
        if (list->SetCount(kPoints) != S_OK || list->GetPointBuffer(&buffer) != S_OK ||
            buffer->GetRange(0, kPoints, &begin, &end) != S_OK) {
            state.SkipWithError("point list refused the points");
            break;
        }
        WriteRecords(begin, kPoints);
        benchmark::DoNotOptimize(begin);
        benchmark::ClobberMemory();
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * kPoints);
}

void BM_CallocBlockWritten(benchmark::State& state) {
    for (auto _ : state) {
        auto* points = static_cast<PatternPoint*>(std::calloc(kPoints, sizeof(PatternPoint)));
        if (points == nullptr) {
            state.SkipWithError("calloc failed");
            break;
        }
        WriteRecords(points, kPoints);
        benchmark::DoNotOptimize(points);
        benchmark::ClobberMemory();
        std::free(points);
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * kPoints);
}

// Wall-clock time: most of the cost is the system handing out and zeroing fresh pages.
BENCHMARK(BM_PointListSizedAndWritten)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(BM_CallocBlockWritten)->Unit(benchmark::kMillisecond)->UseRealTime();

} // namespace

// Filtering a rendering of 10 million exposing points (a 4000 × 2500 grid over the whole field, framed
// by the usual lead-in and post-blanking points) through a circle of radius 0.25 at the centre, which
// removes about a fifth of them. Three runs report points per second: the filter on a plain block with a
// circle containment test, the same through an exclusion zone holding a circle shape, and the floor of
// any such pass: writing 10 million 8-byte records into a fresh calloc'd block.
#include "composition/point_filter.h"
#include "core/point_buffer_view.h"
#include "module/class_table.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"

#include <beamweaver/exclusion.h>
#include <beamweaver/pattern.h>

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <functional>
#include <vector>

using namespace Norvane::Lumis;
using namespace Norvane::Lumis::Scanning;

namespace {

constexpr std::uint32_t kColumns = 4000;
constexpr std::uint32_t kRows = 2500;
constexpr std::uint32_t kExposing = kColumns * kRows;

std::uint16_t GridPosition(std::uint32_t index, std::uint32_t count) {
    return static_cast<std::uint16_t>(std::uint64_t{index} * 65535 / (count - 1));
}

const std::vector<PatternPoint>& Rendering() {
    static const std::vector<PatternPoint> points = [] {
        std::vector<PatternPoint> rendering;
        rendering.reserve(kExposing + 3);
        rendering.push_back(MakePoint(0, 0, 40, PointFlag_Blank));
        rendering.push_back(MakePoint(0, 0, 2, 0));
        for (std::uint32_t row = 0; row < kRows; ++row)
            for (std::uint32_t column = 0; column < kColumns; ++column)
                rendering.push_back(MakePoint(GridPosition(column, kColumns), GridPosition(row, kRows), 7,
                                              PointFlag_Acquire));
        rendering.push_back(MakePoint(65535, 65535, 40, PointFlag_Blank));
        return rendering;
    }();
    return points;
}

bool InCentralCircle(coordinate<double> p) {
    const double dx = p.x - 0.5;
    const double dy = p.y - 0.5;
    return dx * dx + dy * dy <= 0.25 * 0.25;
}

void BM_FilterPointsCircle(benchmark::State& state) {
    const std::vector<PatternPoint>& rendering = Rendering();
    std::vector<PatternPoint> working(rendering.size());
    const std::function<bool(coordinate<double>)> contains = InCentralCircle;
    const ShapeView shape{.matrix = {}, .rangeX = {0, 65535}, .rangeY = {0, 65535}, .contains = &contains};
    std::uint32_t kept = 0;
    for (auto _ : state) {
        state.PauseTiming();
        std::copy(rendering.begin(), rendering.end(), working.begin());
        state.ResumeTiming();
        kept = FilterPoints(working, 0, 0, shape);
        benchmark::DoNotOptimize(working.data());
        benchmark::ClobberMemory();
    }
    state.counters["kept"] = kept;
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) *
                            static_cast<std::int64_t>(rendering.size()));
}

CComPtr<IPatternPointFilter> CircleZone() {
    RegisterComponents();
    const auto circle = Norvane::CreateInstance<IShapeCircle>(CLSID_ShapeCircle);
    const auto zone = Norvane::CreateInstance<IExclusionZone>(CLSID_ExclusionZone);
    if (circle->put_Center(CreateCoordinate({0.5, 0.5})) != S_OK || circle->put_OuterRadius(0.25) != S_OK ||
        zone->AddShape(circle) != S_OK)
        return nullptr;
    return QueryAs<IPatternPointFilter>(zone.Get());
}

void BM_ExclusionZoneCircle(benchmark::State& state) {
    const std::vector<PatternPoint>& rendering = Rendering();
    const auto filter = CircleZone();
    const auto list = Norvane::CreateInstance<IPatternPointList>(CLSID_PatternPointList);
    if (!filter) {
        state.SkipWithError("the circle zone could not be built");
        return;
    }
    const auto count = static_cast<std::uint32_t>(rendering.size());
    for (auto _ : state) {
        state.PauseTiming();
        if (list->SetCount(count) != S_OK) {
            state.SkipWithError("point list refused the points");
            break;
        }
        {
            const PointBufferView view(list);
            std::copy(rendering.begin(), rendering.end(), view.Points().begin());
        }
        state.ResumeTiming();
        if (filter->FilterList(list) != S_OK) {
            state.SkipWithError("filtering failed");
            break;
        }
        benchmark::ClobberMemory();
    }
    state.counters["kept"] = PointCount(list);
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * count);
}

void BM_CallocBlockWritten(benchmark::State& state) {
    for (auto _ : state) {
        auto* points = static_cast<PatternPoint*>(std::calloc(kExposing, sizeof(PatternPoint)));
        if (points == nullptr) {
            state.SkipWithError("calloc failed");
            break;
        }
        for (std::uint32_t i = 0; i < kExposing; ++i)
            StorePoint(points + i, MakePoint(static_cast<std::uint16_t>(i),
                                             static_cast<std::uint16_t>(i >> 16), 7, PointFlag_Acquire));
        benchmark::DoNotOptimize(points);
        benchmark::ClobberMemory();
        std::free(points);
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * kExposing);
}

BENCHMARK(BM_FilterPointsCircle)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(BM_ExclusionZoneCircle)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(BM_CallocBlockWritten)->Unit(benchmark::kMillisecond)->UseRealTime();

} // namespace

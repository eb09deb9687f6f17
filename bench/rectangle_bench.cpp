// Rendering a solid rectangle of about ten million points through the pattern's public interface (list
// allocation, generation, transformation and packaging included), against the floor of the same work:
// writing as many 8-byte records, composed whole, into a fresh calloc'd block. All report points per
// second.
#include "core/scan_strategy_conversions.h"
#include "core/scan_strategy_values.h"
#include "module/class_table.h"
#include "module/create_instance.h"
#include "module/error_reporting.h"
#include "module/geometry_io.h"

#include <beamweaver/shapes.h>

#include <benchmark/benchmark.h>

#include <cmath>
#include <cstdint>
#include <cstdlib>

namespace {

using namespace Norvane::Lumis;
using namespace Norvane::Lumis::Scanning;

// Field 0..65535 on both axes and pitch 21.5 / 65535: sx = sy = trunc(21.5) = 21, kx = ky =
// trunc(65535 / 21) = 3120, so 3121 x 3121 = 9740641 pattern points, plus 3 blanking points.
constexpr double kPitch = 21.5 / 65535.0;
constexpr std::uint32_t kListPoints = 3121u * 3121u + 3u;

void UseFullDacField(IPatternRectangle* rectangle) {
    CComPtr<IPatternRenderingProperties> properties;
    Norvane::CheckResult(rectangle->get_RenderingProperties(&properties));
    for (bool xAxis : {true, false}) {
        CComPtr<IPatternAlignments> alignments;
        Norvane::CheckResult(xAxis ? properties->get_PatternAlignmentsX(&alignments)
                                   : properties->get_PatternAlignmentsY(&alignments));
        Norvane::CheckResult(alignments->put_Range(CreateRange({0, 65535})));
        Norvane::CheckResult(xAxis ? properties->put_PatternAlignmentsX(alignments)
                                   : properties->put_PatternAlignmentsY(alignments));
    }
    Norvane::CheckResult(rectangle->put_RenderingProperties(properties));
}

CComPtr<IPatternRectangle> MakeRectangle(ScanType scanType, const TransformationMatrix& matrix) {
    RegisterComponents();
    auto rectangle = Norvane::CreateInstance<IPatternRectangle>(CLSID_PatternRectangle);
    UseFullDacField(rectangle);
    RectangularStrategy strategy;
    strategy.pitchX = kPitch;
    strategy.pitchY = kPitch;
    strategy.scanType = scanType;
    Norvane::CheckResult(rectangle->put_ScanStrategy(MakeScanStrategyRectangular(strategy)));
    Norvane::CheckResult(rectangle->put_TransformationMatrix(CreateMatrix(matrix)));
    return rectangle;
}

void RenderRectangle(benchmark::State& state, ScanType scanType, const TransformationMatrix& matrix) {
    const CComPtr<IPatternRectangle> rectangle = MakeRectangle(scanType, matrix);
    for (auto _ : state) {
        CComPtr<IScanDefinition> definition;
        if (rectangle->Render(&definition) != S_OK) {
            state.SkipWithError("render failed");
            break;
        }
        benchmark::DoNotOptimize(definition.Get());
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * kListPoints);
}

void BM_RectangleSolid(benchmark::State& state) {
    RenderRectangle(state, ScanType_Raster, {});
}

void BM_RectangleSerpentine(benchmark::State& state) {
    RenderRectangle(state, ScanType_Serpentine, {});
}

// Ten degrees about the origin: every point is converted, mapped and converted back.
void BM_RectangleRotated(benchmark::State& state) {
    const double angle = 10.0 * std::acos(-1.0) / 180.0;
    const double c = std::cos(angle);
    const double s = std::sin(angle);
    RenderRectangle(state, ScanType_Raster, {c, -s, 0.0, s, c, 0.0});
}

void BM_CallocBlockWritten(benchmark::State& state) {
    for (auto _ : state) {
        auto* points = static_cast<PatternPoint*>(std::calloc(kListPoints, sizeof(PatternPoint)));
        if (points == nullptr) {
            state.SkipWithError("calloc failed");
            break;
        }
        for (std::uint32_t i = 0; i < kListPoints; ++i)
            StorePoint(points + i, MakePoint(static_cast<std::uint16_t>(i),
                                             static_cast<std::uint16_t>(i >> 16), 40, PointFlag_Acquire));
        benchmark::DoNotOptimize(points);
        benchmark::ClobberMemory();
        std::free(points);
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * kListPoints);
}

// Wall-clock time: a good part of the cost is the system handing out and zeroing fresh pages.
BENCHMARK(BM_RectangleSolid)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(BM_RectangleSerpentine)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(BM_RectangleRotated)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(BM_CallocBlockWritten)->Unit(benchmark::kMillisecond)->UseRealTime();

} // namespace

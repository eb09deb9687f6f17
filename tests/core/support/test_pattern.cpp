#include "test_pattern.h"

#include "comtypes/comtypes_registration.h"
#include "core/rendering_classes.h"
#include "dwellmap/dwellmap_registration.h"
#include "module/geometry_io.h"

#include <algorithm>

namespace Norvane::Lumis::Scanning::Testing {

CTestPattern::CTestPattern() : IPatternShapeImpl<IPatternShape>(CLSID_TestPattern) {}

CTestPattern::CTestPattern(const ScanDeviceConfig& config) : IPatternShapeImpl<IPatternShape>(CLSID_TestPattern, config) {}

HRESULT CTestPattern::Validate(IPatternValidationResult** result) {
    return Guarded(IPatternShape::iid, Mutex(), result, [&] {
        UpdateDwellTimeResolution(dwellTime_);
        const bool valid = GetDwellTimeResolution() <= dwellTime_;
        *result = (valid ? MakeValidResult() : MakeValidationResult(false, u"DwellTime out of range. ")).Detach();
    });
}

HRESULT CTestPattern::GetLoopTime(double* loopTime) {
    return Guarded(IPatternShape::iid, Mutex(), loopTime, [&] {
        *loopTime = GetPreBlankingTotalTime() + static_cast<double>(positions_.size()) * dwellTime_ +
                    GetPostBlankingTime();
    });
}

HRESULT CTestPattern::GetMinDwellTime(double* dwellTime) {
    return Guarded(IPatternShape::iid, Mutex(), dwellTime, [&] { *dwellTime = dwellTime_; });
}

HRESULT CTestPattern::GetMaxDwellTime(double* dwellTime) { return GetMinDwellTime(dwellTime); }

HRESULT CTestPattern::GetDacBoundingBox(IRectangleInt** box) {
    return Guarded(IPatternShape::iid, Mutex(), box, [&] { return E_NOTIMPL; });
}

HRESULT CTestPattern::Accept(IPatternShapeVisitor* visitor) { return visitor ? S_OK : E_POINTER; }

CComPtr<IScanDefinition> CTestPattern::RenderPattern() {
    boost::unique_lock<ObjectMutex> lock(Mutex());
    ValidateOrThrow();
    const auto count = static_cast<std::int32_t>(positions_.size());
    const std::int32_t total = GetLeadInPointCount() + count + GetPostBlankingPointCount();
    CComPtr<IPatternPointList> list = CreatePointList(static_cast<std::uint32_t>(total));
    {
        PointBufferView view(list);
        const auto points = view.Points();
        const DacPosition first = RelativeToDac(positions_.front().x, positions_.front().y);
        std::int32_t next = AddLeadInPoints(points, first, 0);
        const auto ticks = ToDwellTicks(dwellTime_ / GetDwellTimeResolution());
        DacPosition last = first;
        for (const auto& p : positions_) {
            last = RelativeToDac(p.x, p.y);
            next = AddPoints(points, last, {}, 1, ticks, PointFlag_Acquire, next).nextIndex;
        }
        AddPostBlankingPoints(points, last, next);
    }
    TransformPointList(center_, list);
    return PackageShapeRendering(list, dwellTime_);
}

HRESULT CTestFilter::FilterListWithOffset(IPatternPointList* list, std::uint16_t offsetX, std::uint16_t) {
    return Guarded(IPatternPointFilter::iid, [&] {
        std::uint32_t kept = 0;
        {
            PointBufferView view(list);
            const auto points = view.Points();
            for (const PatternPoint& p : points)
                if (!(p.flags & PointFlag_Acquire) || p.x + offsetX <= maximumX_) points[kept++] = p;
        }
        CComPtr<IPatternPointListCount> counter;
        CheckResult(list->QueryInterface(IPatternPointListCount::iid, reinterpret_cast<void**>(&counter)));
        CheckResult(counter->SetPointCount(kept));
    });
}

void RegisterTestComponents() {
    RegisterComTypesClasses();
    RegisterDwellmapClasses();
    RegisterClasses(RenderingClassEntries());
}

CComPtr<IPatternShape> MakeTestPattern(CTestPattern** object) {
    auto* pattern = new CComObject<CTestPattern>();
    CComPtr<IPatternShape> result(pattern);
    if (object) *object = pattern;
    return result;
}

} // namespace Norvane::Lumis::Scanning::Testing

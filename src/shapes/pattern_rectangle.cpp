#include "shapes/pattern_rectangle.h"

#include "core/scan_strategy_conversions.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"

#include <boost/thread/lock_types.hpp>

#include <algorithm>
#include <array>
#include <cmath>
#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

std::u16string ToDescription(const std::string& text) {
    return {text.begin(), text.end()};
}

} // namespace

CPatternRectangle::CPatternRectangle()
    : RectangularFillPatternImpl(CLSID_PatternRectangle, CLSID_ShapeRectangle) {
    UpdateResolutionForDwellTimes();
    UpdateExclusionShape();
}

HRESULT CPatternRectangle::get_Rectangle(IRectangleFloat** value) {
    return Guarded(IID_IPatternRectangle, Mutex(), value,
                   [&] { *value = CreateRectangleFloat(geometry_.rectangle).Detach(); });
}

HRESULT CPatternRectangle::put_Rectangle(IRectangleFloat* value) {
    return Guarded(IID_IPatternRectangle, Mutex(), [&] {
        geometry_.rectangle = ReadRelativeRectangle(value);
        UpdateExclusionShape();
    });
}

HRESULT CPatternRectangle::GetEffectiveLoopTime(double* loopTime) {
    return Guarded(IID_IPatternRectangle, Mutex(), loopTime, [&] { *loopTime = EffectiveLoopTime(); });
}

HRESULT CPatternRectangle::Validate(IPatternValidationResult** result) {
    return Guarded(IID_IPattern, Mutex(), result, [&] { *result = MakeValidation().Detach(); });
}

// Every pass carries its own blanking; a frame, and a solid fill with an unknown MultiPass, is one pass.
HRESULT CPatternRectangle::GetLoopTime(double* loopTime) {
    return Guarded(IID_IPatternRectangle, Mutex(), loopTime, [&] {
        const double pass = GetPreBlankingTotalTime() + EffectiveLoopTime() + GetPostBlankingTime();
        *loopTime = RectanglePassCount(geometry_.strategy) * pass;
    });
}

// The box of all four corners after the matrix, so that a rotated rectangle stays inside it.
HRESULT CPatternRectangle::GetDacBoundingBox(IRectangleInt** boundingBox) {
    return Guarded(IID_IPatternRectangle, Mutex(), boundingBox, [&] {
        const RectangleFloat& area = geometry_.rectangle;
        const TransformationMatrix& m = GetTransformationMatrix();
        const auto map = [&](double x, double y) {
            return coordinate<double>{m.m0 * x + m.m1 * y + m.m2, m.m3 * x + m.m4 * y + m.m5};
        };
        const std::array corners{map(area.left, area.top), map(area.right, area.top),
                                 map(area.right, area.bottom), map(area.left, area.bottom)};
        const RectangleFloat box = GetPointsBoundingBox(corners);
        const DacPosition topLeft = RelativeToDac(box.left, box.top);
        const DacPosition bottomRight = RelativeToDac(box.right, box.bottom);
        *boundingBox = CreateRectangleInt({topLeft.x, topLeft.y, bottomRight.x, bottomRight.y}).Detach();
    });
}

HRESULT CPatternRectangle::Accept(IPatternShapeVisitor* visitor) {
    return Guarded(IID_IPatternRectangle, Mutex(), [&] {
        if (visitor == nullptr)
            return E_POINTER;
        return visitor->VisitPatternRectangle(this);
    });
}

HRESULT CPatternRectangle::Clone(IPattern** clone) {
    return Guarded(IID_ICloneablePattern, Mutex(), clone, [&] {
        CComPtr<ICloneablePattern> created = CreateInstance<ICloneablePattern>(CLSID_PatternRectangle);
        CComPtr<IPatternRectangle> copy;
        CheckResult(created.QueryInterface(&copy));
        CopyRectanglePropertiesTo(copy);
        *clone = copy.Detach();
    });
}

HRESULT CPatternRectangle::CopyTo(IPattern* target) {
    return Guarded(IID_ICloneablePattern, Mutex(), [&] {
        if (target == nullptr)
            throw std::invalid_argument("pIPattern object is null");
        CComPtr<IPatternRectangle> rectangle;
        const HRESULT hr =
            target->QueryInterface(IPatternRectangle::iid, reinterpret_cast<void**>(&rectangle));
        if (FAILED(hr))
            return hr;
        CopyRectanglePropertiesTo(rectangle);
        return S_OK;
    });
}

CComPtr<IScanDefinition> CPatternRectangle::RenderPattern() {
    boost::unique_lock<ObjectMutex> lock(Mutex());
    ValidateOrThrow();
    CComPtr<IPatternPointList> list =
        CreatePointList(static_cast<std::uint32_t>(RectangleListPointCount(geometry_, *this)));
    WriteRectanglePoints(PointBufferView(list).Points(), geometry_, *this, PointFlags());
    TransformPointList({0.0, 0.0}, list);
    return PackageShapeRendering(list, RectangleMeanDwellTime(geometry_));
}

void CPatternRectangle::OnRenderingSettingsChanged(const PatternRenderingSettings&) {
    UpdateExclusionShape();
}

// Dwell times finer than the resolution first, then pitches that give no grid.
CComPtr<IPatternValidationResult> CPatternRectangle::MakeValidation() {
    UpdateResolutionForDwellTimes();
    const double resolution = CPattern::GetDwellTimeResolution();
    std::string description;
    if (resolution > geometry_.beginDwellTime)
        description += "BeginDwellTime out of range. ";
    if (resolution > geometry_.endDwellTime)
        description += "EndDwellTime out of range. ";
    description += RectangleGridProblems(geometry_, *this);
    return MakeValidationResult(description.empty(), ToDescription(description));
}

double CPatternRectangle::EffectiveLoopTime() {
    ValidateOrThrow();
    return RectangleEffectiveLoopTime(geometry_, *this);
}

std::uint8_t CPatternRectangle::PointFlags() const {
    return IsExclusion() ? PointFlag_Blank : PointFlag_Acquire;
}

void CPatternRectangle::UpdateExclusionShape() {
    if (!Shape())
        return;
    CheckResult(Shape()->put_Rectangle(CreateRectangleFloat(geometry_.rectangle)));
    CheckResult(Shape()->put_TransformationMatrix(CreateMatrix(GetTransformationMatrix())));
    CheckResult(Shape()->put_DACRangeX(CreateRange(GetAlignmentX().range)));
    CheckResult(Shape()->put_DACRangeY(CreateRange(GetAlignmentY().range)));
}

// Common properties first, then the rectangle's own through the target's setters; the first failing
// setter ends the copy with its error, and what was copied before stays copied.
void CPatternRectangle::CopyRectanglePropertiesTo(IPatternRectangle* target) {
    CopyCommonPatternProperties(this, target);
    CheckResult(target->put_Rectangle(CreateRectangleFloat(geometry_.rectangle)));
    CheckResult(target->put_BeginDwellTime(geometry_.beginDwellTime));
    CheckResult(target->put_EndDwellTime(geometry_.endDwellTime));
    CheckResult(target->put_ScanStrategy(MakeScanStrategyRectangular(geometry_.strategy)));
    CheckResult(target->put_TransformationMatrix(CreateMatrix(GetTransformationMatrix())));
}

} // namespace Norvane::Lumis::Scanning

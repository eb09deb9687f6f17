#include "shapes/pattern_circle.h"

#include "core/scan_strategy_conversions.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"
#include "module/hresult_exception.h"

#include <boost/thread/lock_types.hpp>

#include <algorithm>
#include <cmath>
#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

constexpr double kTwoPi = 6.283185307179586;

bool IsPitch(double value) {
    return value > 0.0 && value < 1.0;
}

bool IsRadius(double value) {
    return value >= 0.0 && value <= 1.0;
}

std::u16string ToDescription(const std::string& text) {
    return {text.begin(), text.end()};
}

} // namespace

CPatternCircle::CPatternCircle()
    : ExcludablePatternImpl<IPatternCircle, IShapeCircle>(CLSID_PatternCircle, CLSID_ShapeCircle) {
    UpdateResolutionForDwellTimes();
    UpdateExclusionShape();
}

CPatternCircle::CPatternCircle(coordinate<double> center, double radius, std::int32_t numberOfPoints,
                               double dwellTime)
    : CPatternCircle() {
    circle_.center = center;
    circle_.innerRadius = radius;
    circle_.outerRadius = radius;
    circle_.innerDwellTime = dwellTime;
    circle_.outerDwellTime = dwellTime;
    circle_.circular.pitchR = radius;
    circle_.circular.pitchT = radius * kTwoPi / numberOfPoints;
    circle_.circular.fillStyle = FillStyle_Frame;
    circle_.circular.multiPass = MultiPass_None;
    circle_.circularKind = true;
    circle_.fillStyle = FillStyle_Frame;
    circle_.multiPass = MultiPass_None;
    UpdateResolutionForDwellTimes();
    UpdateExclusionShape();
}

HRESULT CPatternCircle::get_Center(ICoordinateFloat** value) {
    return Guarded(IID_IPatternCircle, Mutex(), value,
                   [&] { *value = CreateCoordinate(circle_.center).Detach(); });
}

HRESULT CPatternCircle::put_Center(ICoordinateFloat* value) {
    return Guarded(IID_IPatternCircle, Mutex(), [&] {
        if (value == nullptr)
            throw HResultException(E_POINTER, "null ICoordinateFloat");
        circle_.center = ReadRelativeCoordinate(value, "Origin");
        UpdateExclusionShape();
    });
}

HRESULT CPatternCircle::get_InnerRadius(double* value) {
    return Guarded(IID_IPatternCircle, Mutex(), value, [&] { *value = circle_.innerRadius; });
}

HRESULT CPatternCircle::put_InnerRadius(double value) {
    return PutRadius(value, &CircleGeometry::innerRadius);
}

HRESULT CPatternCircle::get_OuterRadius(double* value) {
    return Guarded(IID_IPatternCircle, Mutex(), value, [&] { *value = circle_.outerRadius; });
}

HRESULT CPatternCircle::put_OuterRadius(double value) {
    return PutRadius(value, &CircleGeometry::outerRadius);
}

HRESULT CPatternCircle::get_InnerDwellTime(double* value) {
    return Guarded(IID_IPatternCircle, Mutex(), value, [&] { *value = circle_.innerDwellTime; });
}

HRESULT CPatternCircle::put_InnerDwellTime(double value) {
    return PutDwellTime(value, &CircleGeometry::innerDwellTime);
}

HRESULT CPatternCircle::get_OuterDwellTime(double* value) {
    return Guarded(IID_IPatternCircle, Mutex(), value, [&] { *value = circle_.outerDwellTime; });
}

HRESULT CPatternCircle::put_OuterDwellTime(double value) {
    return PutDwellTime(value, &CircleGeometry::outerDwellTime);
}

HRESULT CPatternCircle::get_ScanStrategy(IScanStrategy** value) {
    return Guarded(IID_IPatternCircle, Mutex(), value, [&] { *value = MakeStrategy().Detach(); });
}

// The kind switches to that of the offered strategy before its values are checked, so a refused strategy
// still selects its kind; an object of neither kind changes nothing.
HRESULT CPatternCircle::put_ScanStrategy(IScanStrategy* value) {
    return Guarded(IID_IPatternCircle, Mutex(), [&] {
        if (value == nullptr)
            throw std::invalid_argument("ScanStrategy object is null");
        if (CComPtr<IScanStrategyCircular> circular = QueryAs<IScanStrategyCircular>(value))
            return AcceptCircularStrategy(circular);
        if (CComPtr<IScanStrategyRectangular> rectangular = QueryAs<IScanStrategyRectangular>(value))
            return AcceptRectangularStrategy(rectangular);
        return S_OK;
    });
}

HRESULT CPatternCircle::get_TransformationMatrix(ITransformationMatrix2D** value) {
    return Guarded(IID_IPatternCircle, Mutex(), value,
                   [&] { *value = CreateMatrix(GetTransformationMatrix()).Detach(); });
}

HRESULT CPatternCircle::put_TransformationMatrix(ITransformationMatrix2D* value) {
    return Guarded(IID_IPatternCircle, Mutex(), [&] {
        SetTransformationMatrix(ReadMatrixProperty(value, "TransformationMatrix"));
        UpdateExclusionShape();
    });
}

HRESULT CPatternCircle::get_InnerCircleBlankingTime(double* value) {
    return Guarded(IID_IPatternCircle, Mutex(), value, [&] { *value = circle_.innerCircleBlankingTime; });
}

// Zero is accepted: lines crossing the hole then jump it without blanking points.
HRESULT CPatternCircle::put_InnerCircleBlankingTime(double value) {
    return Guarded(IID_IPatternCircle, Mutex(), [&] {
        if (!(value >= 0.0 && std::isfinite(value)))
            return E_INVALIDARG;
        circle_.innerCircleBlankingTime = value;
        return S_OK;
    });
}

HRESULT CPatternCircle::GetEffectiveLoopTime(double* loopTime) {
    return Guarded(IID_IPatternCircle, Mutex(), loopTime, [&] { *loopTime = EffectiveLoopTime(); });
}

HRESULT CPatternCircle::Validate(IPatternValidationResult** result) {
    return Guarded(IID_IPattern, Mutex(), result, [&] { *result = MakeValidation().Detach(); });
}

// Both passes of a ring scan each carry the effective time; a frame writes its ring once whatever the
// multi-pass says, so it counts once.
HRESULT CPatternCircle::GetLoopTime(double* loopTime) {
    return Guarded(IID_IPatternCircle, Mutex(), loopTime, [&] {
        const bool twoPasses =
            circle_.fillStyle != FillStyle_Frame && circle_.multiPass == MultiPass_OneOrientation;
        *loopTime =
            GetPreBlankingTotalTime() + EffectiveLoopTime() * (twoPasses ? 2.0 : 1.0) + GetPostBlankingTime();
    });
}

HRESULT CPatternCircle::GetMinDwellTime(double* dwellTime) {
    return Guarded(IID_IPatternCircle, Mutex(), dwellTime,
                   [&] { *dwellTime = std::min(circle_.innerDwellTime, circle_.outerDwellTime); });
}

HRESULT CPatternCircle::GetMaxDwellTime(double* dwellTime) {
    return Guarded(IID_IPatternCircle, Mutex(), dwellTime,
                   [&] { *dwellTime = std::max(circle_.innerDwellTime, circle_.outerDwellTime); });
}

// The square of the outer radius around the transformed centre; the radius itself is not scaled.
HRESULT CPatternCircle::GetDacBoundingBox(IRectangleInt** boundingBox) {
    return Guarded(IID_IPatternCircle, Mutex(), boundingBox, [&] {
        const TransformationMatrix& m = GetTransformationMatrix();
        const coordinate<double>& c = circle_.center;
        const double x = m.m0 * c.x + m.m1 * c.y + m.m2;
        const double y = m.m3 * c.x + m.m4 * c.y + m.m5;
        const double radius = circle_.outerRadius;
        const DacPosition topLeft = RelativeToDac(x - radius, y - radius);
        const DacPosition bottomRight = RelativeToDac(x + radius, y + radius);
        *boundingBox = CreateRectangleInt({topLeft.x, topLeft.y, bottomRight.x, bottomRight.y}).Detach();
    });
}

HRESULT CPatternCircle::Accept(IPatternShapeVisitor* visitor) {
    return Guarded(IID_IPatternCircle, Mutex(), [&] {
        if (visitor == nullptr)
            return E_POINTER;
        return visitor->VisitPatternCircle(this);
    });
}

HRESULT CPatternCircle::Clone(IPattern** clone) {
    return Guarded(IID_ICloneablePattern, Mutex(), clone, [&] {
        CComPtr<ICloneablePattern> created = CreateInstance<ICloneablePattern>(CLSID_PatternCircle);
        CComPtr<IPatternCircle> copy;
        CheckResult(created.QueryInterface(&copy));
        CopyCirclePropertiesTo(copy);
        *clone = copy.Detach();
    });
}

HRESULT CPatternCircle::CopyTo(IPattern* target) {
    return Guarded(IID_ICloneablePattern, Mutex(), [&] {
        if (target == nullptr)
            throw std::invalid_argument("pIPattern object is null");
        CComPtr<IPatternCircle> circle;
        const HRESULT hr = target->QueryInterface(IPatternCircle::iid, reinterpret_cast<void**>(&circle));
        if (FAILED(hr))
            return hr;
        CopyCirclePropertiesTo(circle);
        return S_OK;
    });
}

CComPtr<IScanDefinition> CPatternCircle::RenderPattern() {
    boost::unique_lock<ObjectMutex> lock(Mutex());
    ValidateOrThrow();
    CComPtr<IPatternPointList> list =
        CreatePointList(static_cast<std::uint32_t>(CircleListPointCount(circle_, *this)));
    WriteCirclePoints(PointBufferView(list).Points(), circle_, *this, PointFlags());
    TransformPointList({0.0, 0.0}, list);
    return PackageShapeRendering(list, (circle_.innerDwellTime + circle_.outerDwellTime) * 0.5);
}

void CPatternCircle::OnRenderingSettingsChanged(const PatternRenderingSettings&) {
    UpdateExclusionShape();
}

HRESULT CPatternCircle::PutRadius(double value, double CircleGeometry::*field) {
    return Guarded(IID_IPatternCircle, Mutex(), [&] {
        if (!IsRadius(value))
            return E_INVALIDARG;
        circle_.*field = value;
        UpdateExclusionShape();
        return S_OK;
    });
}

HRESULT CPatternCircle::PutDwellTime(double value, double CircleGeometry::*field) {
    return Guarded(IID_IPatternCircle, Mutex(), [&] {
        if (!(value > 0.0 && std::isfinite(value)))
            return E_INVALIDARG;
        circle_.*field = value;
        UpdateResolutionForDwellTimes();
        return S_OK;
    });
}

HRESULT CPatternCircle::AcceptCircularStrategy(IScanStrategyCircular* strategy) {
    circle_.circularKind = true;
    const CircularStrategy values = ReadScanStrategyCircular(strategy);
    if (!(IsPitch(values.pitchT) && IsPitch(values.pitchR)))
        return E_INVALIDARG;
    if (values.multiPass == MultiPass_AllOrientations)
        return E_NOTIMPL;
    circle_.circular = values;
    circle_.fillStyle = values.fillStyle;
    circle_.multiPass = values.multiPass;
    return S_OK;
}

HRESULT CPatternCircle::AcceptRectangularStrategy(IScanStrategyRectangular* strategy) {
    circle_.circularKind = false;
    const RectangularStrategy values = ReadScanStrategyRectangular(strategy);
    if (!(IsPitch(values.pitchX) && IsPitch(values.pitchY)))
        return E_INVALIDARG;
    if (values.multiPass == MultiPass_OneOrientation || values.multiPass == MultiPass_AllOrientations)
        return E_NOTIMPL;
    if (values.scanType == ScanType_Raster)
        return E_NOTIMPL;
    if (values.fillStyle == FillStyle_Frame)
        return E_UNEXPECTED;
    circle_.rectangular = values;
    circle_.fillStyle = values.fillStyle;
    circle_.multiPass = values.multiPass;
    return S_OK;
}

CComPtr<IScanStrategy> CPatternCircle::MakeStrategy() const {
    if (circle_.circularKind)
        return QueryAs<IScanStrategy>(MakeScanStrategyCircular(circle_.circular).Get());
    return QueryAs<IScanStrategy>(MakeScanStrategyRectangular(circle_.rectangular).Get());
}

void CPatternCircle::UpdateResolutionForDwellTimes() {
    UpdateDwellTimeResolution(std::max(circle_.innerDwellTime, circle_.outerDwellTime));
}

// Dwell times within [resolution, maximum point dwell], then a list that fits a 32-bit count.
CComPtr<IPatternValidationResult> CPatternCircle::MakeValidation() {
    UpdateResolutionForDwellTimes();
    const double resolution = CPattern::GetDwellTimeResolution();
    const double maximum = GetMaxPointDwellTime();
    std::string description;
    if (!(circle_.innerDwellTime >= resolution && circle_.innerDwellTime <= maximum))
        description += "InnerDwellTime out of range. ";
    if (!(circle_.outerDwellTime >= resolution && circle_.outerDwellTime <= maximum))
        description += "OuterDwellTime out of range. ";
    if (description.empty())
        description += CircleCountProblems(circle_, *this);
    return MakeValidationResult(description.empty(), ToDescription(description));
}

double CPatternCircle::EffectiveLoopTime() {
    ValidateOrThrow();
    return CircleEffectiveLoopTime(circle_, *this);
}

std::uint8_t CPatternCircle::PointFlags() const {
    return IsExclusion() ? PointFlag_Blank : PointFlag_Acquire;
}

void CPatternCircle::UpdateExclusionShape() {
    if (!Shape())
        return;
    CheckResult(Shape()->put_Center(CreateCoordinate(circle_.center)));
    CheckResult(Shape()->put_InnerRadius(circle_.innerRadius));
    CheckResult(Shape()->put_OuterRadius(circle_.outerRadius));
    CheckResult(Shape()->put_TransformationMatrix(CreateMatrix(GetTransformationMatrix())));
    CheckResult(Shape()->put_DACRangeX(CreateRange(GetAlignmentX().range)));
    CheckResult(Shape()->put_DACRangeY(CreateRange(GetAlignmentY().range)));
}

// Common properties first, then the circle's own through the target's setters; the first failing setter
// ends the copy with its error, and what was copied before stays copied.
void CPatternCircle::CopyCirclePropertiesTo(IPatternCircle* target) {
    CopyCommonPatternProperties(this, target);
    CheckResult(target->put_Center(CreateCoordinate(circle_.center)));
    CheckResult(target->put_InnerRadius(circle_.innerRadius));
    CheckResult(target->put_OuterRadius(circle_.outerRadius));
    CheckResult(target->put_InnerDwellTime(circle_.innerDwellTime));
    CheckResult(target->put_OuterDwellTime(circle_.outerDwellTime));
    CheckResult(target->put_ScanStrategy(MakeStrategy()));
    CheckResult(target->put_TransformationMatrix(CreateMatrix(GetTransformationMatrix())));
    CheckResult(target->put_InnerCircleBlankingTime(circle_.innerCircleBlankingTime));
}

CComPtr<IPatternCircle> CreateCircularScanPattern(coordinate<double> center, double radius,
                                                  std::int32_t numberOfPoints, double dwellTime) {
    return CComObjectEx<CPatternCircle>::CreateInstance<IPatternCircle>(center, radius, numberOfPoints,
                                                                        dwellTime);
}

} // namespace Norvane::Lumis::Scanning

#include "shapes/pattern_polygon.h"

#include "core/scan_strategy_conversions.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"

#include <boost/thread/lock_types.hpp>

#include <algorithm>
#include <cmath>
#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

std::u16string ToDescription(const std::string& text) {
    return {text.begin(), text.end()};
}

} // namespace

CPatternPolygon::CPatternPolygon() : RectangularFillPatternImpl(CLSID_PatternPolygon, CLSID_ShapePolygon) {
    UpdateResolutionForDwellTimes();
    UpdateExclusionShape();
}

// The shape takes the vertex first, so that a refusal there leaves both unchanged.
HRESULT CPatternPolygon::AddPoint(ICoordinateFloat* point) {
    return Guarded(IID_IPatternPolygon, Mutex(), [&] {
        const coordinate<double> vertex = ReadRelativeCoordinate(point, "Point");
        CheckResult(Shape()->AddPoint(CreateCoordinate(vertex)));
        geometry_.vertices.push_back(vertex);
    });
}

HRESULT CPatternPolygon::ModifyPoint(std::int32_t index, ICoordinateFloat* point) {
    return Guarded(IID_IPatternPolygon, Mutex(), [&] {
        const coordinate<double> vertex = ReadRelativeCoordinate(point, "Point");
        if (index < 0 || static_cast<std::size_t>(index) >= geometry_.vertices.size())
            throw std::invalid_argument("Index out of range");
        CheckResult(Shape()->ModifyPoint(index, CreateCoordinate(vertex)));
        geometry_.vertices[static_cast<std::size_t>(index)] = vertex;
    });
}

HRESULT CPatternPolygon::GetEffectiveLoopTime(double* loopTime) {
    return Guarded(IID_IPatternPolygon, Mutex(), loopTime, [&] { *loopTime = EffectiveLoopTime(); });
}

HRESULT CPatternPolygon::Validate(IPatternValidationResult** result) {
    return Guarded(IID_IPattern, Mutex(), result, [&] { *result = MakeValidation().Detach(); });
}

// Every pass carries its own blanking; a frame is one pass.
HRESULT CPatternPolygon::GetLoopTime(double* loopTime) {
    return Guarded(IID_IPatternPolygon, Mutex(), loopTime, [&] {
        const double pass = GetPreBlankingTotalTime() + EffectiveLoopTime() + GetPostBlankingTime();
        *loopTime = PolygonPassCount(geometry_.strategy) * pass;
    });
}

// The vertices' box, its two corners mapped by the matrix about the origin and put in order.
HRESULT CPatternPolygon::GetDacBoundingBox(IRectangleInt** boundingBox) {
    return Guarded(IID_IPatternPolygon, Mutex(), boundingBox, [&] {
        const RectangleFloat box = GetPointsBoundingBox(geometry_.vertices);
        *boundingBox =
            CreateRectangleInt(TransformedDacBox({box.left, box.top}, {box.right, box.bottom})).Detach();
    });
}

HRESULT CPatternPolygon::Accept(IPatternShapeVisitor* visitor) {
    return Guarded(IID_IPatternPolygon, Mutex(), [&] {
        if (visitor == nullptr)
            return E_POINTER;
        return visitor->VisitPatternPolygon(this);
    });
}

HRESULT CPatternPolygon::Clone(IPattern** clone) {
    return Guarded(IID_ICloneablePattern, Mutex(), clone, [&] {
        CComPtr<ICloneablePattern> created = CreateInstance<ICloneablePattern>(CLSID_PatternPolygon);
        CComPtr<IPatternPolygon> copy;
        CheckResult(created.QueryInterface(&copy));
        CopyPolygonPropertiesTo(copy);
        *clone = copy.Detach();
    });
}

HRESULT CPatternPolygon::CopyTo(IPattern* target) {
    return Guarded(IID_ICloneablePattern, Mutex(), [&] {
        if (target == nullptr)
            throw std::invalid_argument("pIPattern object is null");
        CComPtr<IPatternPolygon> polygon;
        const HRESULT hr = target->QueryInterface(IPatternPolygon::iid, reinterpret_cast<void**>(&polygon));
        if (FAILED(hr))
            return hr;
        CopyPolygonPropertiesTo(polygon);
        return S_OK;
    });
}

CComPtr<IScanDefinition> CPatternPolygon::RenderPattern() {
    boost::unique_lock<ObjectMutex> lock(Mutex());
    ValidateOrThrow();
    CComPtr<IPatternPointList> list =
        CreatePointList(static_cast<std::uint32_t>(PolygonListPointCount(geometry_, *this)));
    WritePolygonPoints(PointBufferView(list).Points(), geometry_, *this, PointFlags());
    TransformPointList({0.0, 0.0}, list);
    return PackageShapeRendering(list, PolygonMeanDwellTime(geometry_));
}

void CPatternPolygon::OnRenderingSettingsChanged(const PatternRenderingSettings&) {
    UpdateExclusionShape();
}

CComPtr<IPatternValidationResult> CPatternPolygon::MakeValidation() {
    UpdateResolutionForDwellTimes();
    const std::string description = PolygonValidationProblems(geometry_, *this);
    return MakeValidationResult(description.empty(), ToDescription(description));
}

double CPatternPolygon::EffectiveLoopTime() {
    ValidateOrThrow();
    return PolygonEffectiveLoopTime(geometry_, *this);
}

std::uint8_t CPatternPolygon::PointFlags() const {
    return IsExclusion() ? PointFlag_Blank : PointFlag_Acquire;
}

void CPatternPolygon::UpdateExclusionShape() {
    if (!Shape())
        return;
    CheckResult(Shape()->put_TransformationMatrix(CreateMatrix(GetTransformationMatrix())));
    CheckResult(Shape()->put_DACRangeX(CreateRange(GetAlignmentX().range)));
    CheckResult(Shape()->put_DACRangeY(CreateRange(GetAlignmentY().range)));
}

// Common properties first, then the polygon's own, its vertices appended after any the target holds, through
// the target's setters; the first failing setter ends the copy with its error, and what was copied before
// stays copied.
void CPatternPolygon::CopyPolygonPropertiesTo(IPatternPolygon* target) {
    CopyCommonPatternProperties(this, target);
    CheckResult(target->put_BeginDwellTime(geometry_.beginDwellTime));
    CheckResult(target->put_EndDwellTime(geometry_.endDwellTime));
    CheckResult(target->put_ScanStrategy(MakeScanStrategyRectangular(geometry_.strategy)));
    CheckResult(target->put_TransformationMatrix(CreateMatrix(GetTransformationMatrix())));
    for (const coordinate<double>& vertex : geometry_.vertices)
        CheckResult(target->AddPoint(CreateCoordinate(vertex)));
}

} // namespace Norvane::Lumis::Scanning

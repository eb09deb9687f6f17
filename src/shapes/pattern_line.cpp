#include "shapes/pattern_line.h"

#include "module/create_instance.h"
#include "module/geometry_io.h"

#include <boost/thread/lock_types.hpp>

#include <algorithm>
#include <cmath>
#include <stdexcept>

namespace Norvane::Lumis::Scanning {

CPatternLine::CPatternLine() : IPatternShapeImpl<IPatternLine>(CLSID_PatternLine) {
    UpdateResolutionForDwellTimes();
}

HRESULT CPatternLine::get_Begin(ICoordinateFloat** value) {
    return Guarded(IID_IPatternLine, Mutex(), value,
                   [&] { *value = CreateCoordinate(line_.begin).Detach(); });
}

HRESULT CPatternLine::put_Begin(ICoordinateFloat* value) {
    return Guarded(IID_IPatternLine, Mutex(), [&] { line_.begin = ReadRelativeCoordinate(value, "Begin"); });
}

HRESULT CPatternLine::get_End(ICoordinateFloat** value) {
    return Guarded(IID_IPatternLine, Mutex(), value, [&] { *value = CreateCoordinate(line_.end).Detach(); });
}

HRESULT CPatternLine::put_End(ICoordinateFloat* value) {
    return Guarded(IID_IPatternLine, Mutex(), [&] { line_.end = ReadRelativeCoordinate(value, "End"); });
}

HRESULT CPatternLine::get_BeginDwellTime(double* value) {
    return Guarded(IID_IPatternLine, Mutex(), value, [&] { *value = line_.beginDwellTime; });
}

HRESULT CPatternLine::put_BeginDwellTime(double value) {
    return PutDwellTime(value, &LineGeometry::beginDwellTime);
}

HRESULT CPatternLine::get_EndDwellTime(double* value) {
    return Guarded(IID_IPatternLine, Mutex(), value, [&] { *value = line_.endDwellTime; });
}

HRESULT CPatternLine::put_EndDwellTime(double value) {
    return PutDwellTime(value, &LineGeometry::endDwellTime);
}

HRESULT CPatternLine::get_Pitch(double* value) {
    return Guarded(IID_IPatternLine, Mutex(), value, [&] { *value = line_.pitch; });
}

HRESULT CPatternLine::put_Pitch(double value) {
    return Guarded(IID_IPatternLine, Mutex(), [&] {
        if (!(value > 0.0 && value < 1.0))
            return E_INVALIDARG;
        line_.pitch = value;
        return S_OK;
    });
}

HRESULT CPatternLine::get_ScanDirection(ScanDirection* value) {
    return Guarded(IID_IPatternLine, Mutex(), value, [&] { *value = line_.scanDirection; });
}

HRESULT CPatternLine::put_ScanDirection(ScanDirection value) {
    return Guarded(IID_IPatternLine, Mutex(), [&] { line_.scanDirection = value; });
}

HRESULT CPatternLine::get_TransformationMatrix(ITransformationMatrix2D** value) {
    return Guarded(IID_IPatternLine, Mutex(), value,
                   [&] { *value = CreateMatrix(GetTransformationMatrix()).Detach(); });
}

HRESULT CPatternLine::put_TransformationMatrix(ITransformationMatrix2D* value) {
    return Guarded(IID_IPatternLine, Mutex(),
                   [&] { SetTransformationMatrix(ReadMatrixProperty(value, "TransformationMatrix")); });
}

HRESULT CPatternLine::get_MultiPass(MultiPass* value) {
    return Guarded(IID_IPatternLine, Mutex(), value, [&] { *value = line_.multiPass; });
}

// Only a single pass and a forward-and-return pass are rendered; other values would size the list for
// a return pass that is never written.
HRESULT CPatternLine::put_MultiPass(MultiPass value) {
    return Guarded(IID_IPatternLine, Mutex(), [&] {
        if (value != MultiPass_None && value != MultiPass_OneOrientation)
            return E_INVALIDARG;
        line_.multiPass = value;
        return S_OK;
    });
}

HRESULT CPatternLine::GetEffectiveLoopTime(double* loopTime) {
    return Guarded(IID_IPatternLine, Mutex(), loopTime, [&] { *loopTime = EffectiveLoopTime(); });
}

HRESULT CPatternLine::Validate(IPatternValidationResult** result) {
    return Guarded(IID_IPatternLine, Mutex(), result, [&] { *result = MakeValidation().Detach(); });
}

HRESULT CPatternLine::GetLoopTime(double* loopTime) {
    return Guarded(IID_IPatternLine, Mutex(), loopTime, [&] {
        *loopTime =
            GetPreBlankingTotalTime() + EffectiveLoopTime() * LinePassCount(line_) + GetPostBlankingTime();
    });
}

HRESULT CPatternLine::GetMinDwellTime(double* dwellTime) {
    return Guarded(IID_IPatternLine, Mutex(), dwellTime,
                   [&] { *dwellTime = std::min(line_.beginDwellTime, line_.endDwellTime); });
}

HRESULT CPatternLine::GetMaxDwellTime(double* dwellTime) {
    return Guarded(IID_IPatternLine, Mutex(), dwellTime,
                   [&] { *dwellTime = std::max(line_.beginDwellTime, line_.endDwellTime); });
}

// The box of the two corners (min, min) and (max, max) of Begin and End, not of the end points.
HRESULT CPatternLine::GetDacBoundingBox(IRectangleInt** boundingBox) {
    return Guarded(IID_IPatternLine, Mutex(), boundingBox, [&] {
        const coordinate<double> topLeft{std::min(line_.begin.x, line_.end.x),
                                         std::min(line_.begin.y, line_.end.y)};
        const coordinate<double> bottomRight{std::max(line_.begin.x, line_.end.x),
                                             std::max(line_.begin.y, line_.end.y)};
        *boundingBox = CreateRectangleInt(TransformedDacBox(topLeft, bottomRight)).Detach();
    });
}

HRESULT CPatternLine::Accept(IPatternShapeVisitor* visitor) {
    return Guarded(IID_IPatternLine, Mutex(), [&] {
        if (visitor == nullptr)
            return E_POINTER;
        return visitor->VisitPatternLine(this);
    });
}

HRESULT CPatternLine::Clone(IPattern** clone) {
    return Guarded(IID_ICloneablePattern, Mutex(), clone, [&] {
        CComPtr<IPatternLine> copy = CreateInstance<IPatternLine>(CLSID_PatternLine);
        CopyLinePropertiesTo(copy);
        *clone = copy.Detach();
    });
}

HRESULT CPatternLine::CopyTo(IPattern* target) {
    return Guarded(IID_ICloneablePattern, Mutex(), [&] {
        if (target == nullptr)
            throw std::invalid_argument("pIPattern object is null");
        CComPtr<IPatternLine> line;
        const HRESULT hr = target->QueryInterface(IPatternLine::iid, reinterpret_cast<void**>(&line));
        if (FAILED(hr))
            return hr;
        CopyLinePropertiesTo(line);
        return S_OK;
    });
}

CComPtr<IScanDefinition> CPatternLine::RenderPattern() {
    boost::unique_lock<ObjectMutex> lock(Mutex());
    ValidateOrThrow();
    CComPtr<IPatternPointList> list =
        CreatePointList(static_cast<std::uint32_t>(LineListPointCount(line_, *this)));
    WriteLinePoints(PointBufferView(list).Points(), line_, *this);
    TransformPointList({0.0, 0.0}, list);
    return PackageShapeRendering(list, LineMeanDwellTime(line_));
}

HRESULT CPatternLine::PutDwellTime(double value, double LineGeometry::*field) {
    return Guarded(IID_IPatternLine, Mutex(), [&] {
        if (!(value > 0.0 && std::isfinite(value)))
            return E_INVALIDARG;
        line_.*field = value;
        UpdateResolutionForDwellTimes();
        return S_OK;
    });
}

void CPatternLine::UpdateResolutionForDwellTimes() {
    UpdateDwellTimeResolution(std::max(line_.beginDwellTime, line_.endDwellTime));
}

CComPtr<IPatternValidationResult> CPatternLine::MakeValidation() {
    UpdateResolutionForDwellTimes();
    const double resolution = CPattern::GetDwellTimeResolution();
    bool valid = true;
    std::u16string description;
    if (resolution > line_.beginDwellTime) {
        valid = false;
        description += u"BeginDwellTime out of range. ";
    }
    if (resolution > line_.endDwellTime) {
        valid = false;
        description += u"EndDwellTime out of range. ";
    }
    return MakeValidationResult(valid, description);
}

double CPatternLine::EffectiveLoopTime() {
    ValidateOrThrow();
    return LineEffectiveLoopTime(line_);
}

// Common properties first, then the line's own through the target's setters; the first failing setter
// ends the copy with its error, and what was copied before stays copied.
void CPatternLine::CopyLinePropertiesTo(IPatternLine* target) {
    CopyCommonPatternProperties(this, target);
    CheckResult(target->put_Begin(CreateCoordinate(line_.begin)));
    CheckResult(target->put_End(CreateCoordinate(line_.end)));
    CheckResult(target->put_BeginDwellTime(line_.beginDwellTime));
    CheckResult(target->put_EndDwellTime(line_.endDwellTime));
    CheckResult(target->put_Pitch(line_.pitch));
    CheckResult(target->put_ScanDirection(line_.scanDirection));
    CheckResult(target->put_TransformationMatrix(CreateMatrix(GetTransformationMatrix())));
    CheckResult(target->put_MultiPass(line_.multiPass));
}

} // namespace Norvane::Lumis::Scanning

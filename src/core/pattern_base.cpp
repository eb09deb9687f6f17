#include "core/pattern_base.h"

#include "core/scan_device_config.h"
#include "module/create_instance.h"
#include "module/error_reporting.h"
#include "module/geometry_io.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace Norvane::Lumis::Scanning {

namespace {

[[noreturn]] void ThrowInvalidArgument(const char* message) {
    throw HResultException(E_INVALIDARG, message);
}

double Span(const PatternAlignment& alignment) {
    return static_cast<double>(alignment.range.maximum) - static_cast<double>(alignment.range.minimum);
}

// The matrix about a center applied to DAC positions: DacToRelative, the affine map, RelativeToDac, with
// the same operations in the same order as those functions, and the axis constants read once.
class DacAffineMap {
  public:
    DacAffineMap(const PatternRenderingSettings& settings, const TransformationMatrix& matrix,
                 coordinate<double> center)
        : minX_(settings.alignmentX.range.minimum), spanX_(Span(settings.alignmentX)),
          minY_(settings.alignmentY.range.minimum), spanY_(Span(settings.alignmentY)), m_(matrix),
          center_(center) {}

    // The mapped DAC position before truncation.
    coordinate<double> Apply(double x, double y) const {
        const double dx = (x - minX_) / spanX_ - center_.x;
        const double dy = (y - minY_) / spanY_ - center_.y;
        return {minX_ + spanX_ * (center_.x + (m_.m0 * dx + m_.m1 * dy + m_.m2)),
                minY_ + spanY_ * (center_.y + (m_.m3 * dx + m_.m4 * dy + m_.m5))};
    }

  private:
    double minX_;
    double spanX_;
    double minY_;
    double spanY_;
    TransformationMatrix m_;
    coordinate<double> center_;
};

} // namespace

std::uint16_t ClampToDac(double value) {
    if (!(value > 0.0))
        return 0;
    if (value >= 65535.0)
        return 65535;
    return static_cast<std::uint16_t>(value);
}

std::uint16_t ToDwellTicks(double ticks) {
    return ClampToDac(ticks);
}

std::int32_t TruncToInt32(double value) {
    if (std::isnan(value))
        return 0;
    if (value <= static_cast<double>(std::numeric_limits<std::int32_t>::min()))
        return std::numeric_limits<std::int32_t>::min();
    if (value >= static_cast<double>(std::numeric_limits<std::int32_t>::max()))
        return std::numeric_limits<std::int32_t>::max();
    return static_cast<std::int32_t>(value);
}

CPattern::CPattern() : CPattern(LoadScanDeviceConfig()) {}

CPattern::CPattern(const ScanDeviceConfig& config) : config_(config) {}

void CPattern::SetRenderingSettings(const PatternRenderingSettings& settings) {
    settings_ = settings;
    OnRenderingSettingsChanged(settings_);
}

void CPattern::UpdateDwellTimeResolution(double maxDwellTime) {
    const double unit = config_.dwellTimeUnit;
    const double ratio = maxDwellTime / (config_.maximumDwellTimeFactor * unit);
    const double k = std::ceil(std::log(ratio) / 0.6931471805599453);
    const double resolution = k > 0.0 ? unit * std::pow(2.0, k) : unit;
    effectiveResolution_ =
        resolution > settings_.targetDwellTimeResolution ? resolution : settings_.targetDwellTimeResolution;
}

double CPattern::GetMaxPointDwellTime() const {
    return config_.maximumDwellTimeFactor * effectiveResolution_;
}

std::int32_t CPattern::GetGatePulseIdleTicks() const {
    return std::max(1, TruncToInt32(std::ceil(settings_.gatePulseIdleTime / effectiveResolution_)));
}

double CPattern::GetPreBlankingTotalTime() const {
    return settings_.preBlankingTime > 0.0 ? settings_.preBlankingTime + settings_.patternStartAsymmetryTime
                                           : 0.0;
}

std::int32_t CPattern::BlankingPointCount(double time) const {
    if (!(time >= effectiveResolution_))
        return 0;
    return TruncToInt32(std::ceil(time / GetMaxPointDwellTime()));
}

std::int32_t CPattern::GetPreBlankingPointCount() const {
    return BlankingPointCount(settings_.preBlankingTime);
}

std::int32_t CPattern::GetStartAsymmetryPointCount() const {
    return BlankingPointCount(settings_.patternStartAsymmetryTime);
}

std::int32_t CPattern::GetPostBlankingPointCount() const {
    return BlankingPointCount(settings_.postBlankingTime);
}

std::int32_t CPattern::GetLeadInPointCount() const {
    const std::int32_t preBlanking = GetPreBlankingPointCount();
    return preBlanking < 1 ? preBlanking : preBlanking + GetStartAsymmetryPointCount();
}

DacPosition CPattern::RelativeToDac(double x, double y) const {
    const auto& ax = settings_.alignmentX.range;
    const auto& ay = settings_.alignmentY.range;
    return {TruncToInt32(ax.minimum + Span(settings_.alignmentX) * x),
            TruncToInt32(ay.minimum + Span(settings_.alignmentY) * y)};
}

coordinate<double> CPattern::DacToRelative(double x, double y) const {
    return {(x - settings_.alignmentX.range.minimum) / Span(settings_.alignmentX),
            (y - settings_.alignmentY.range.minimum) / Span(settings_.alignmentY)};
}

std::int32_t CPattern::RelativeToDacSpanX(double length) const {
    return TruncToInt32(Span(settings_.alignmentX) * length);
}

std::int32_t CPattern::RelativeToDacSpanY(double length) const {
    return TruncToInt32(Span(settings_.alignmentY) * length);
}

double CPattern::QuantizeRelativeX(double length) const {
    return RelativeToDacSpanX(length) / Span(settings_.alignmentX);
}

double CPattern::QuantizeRelativeY(double length) const {
    return RelativeToDacSpanY(length) / Span(settings_.alignmentY);
}

PointRunEnd CPattern::AddPoints(std::span<PatternPoint> points, DacPosition start, DacStep step,
                                std::int32_t count, std::uint16_t dwellTicks, std::uint8_t flags,
                                std::int32_t firstIndex) const {
    if (count < 0 || firstIndex < 0) ThrowInvalidArgument("Invalid arguments.");
    if (count == 0) return {start, firstIndex};
    if (static_cast<std::size_t>(firstIndex) + static_cast<std::size_t>(count) > points.size())
        ThrowInvalidArgument("Invalid arguments.");
    double x = start.x;
    double y = start.y;
    PatternPoint* out = points.data() + firstIndex;
    for (std::int32_t i = 0; i < count; ++i) {
        StorePoint(out + i, MakePoint(ClampToDac(x), ClampToDac(y), dwellTicks, flags));
        x += step.x;
        y += step.y;
    }
    if (count == 0)
        return {start, firstIndex};
    return {{ClampToDac(x), ClampToDac(y)}, firstIndex + count};
}

PointRunEnd CPattern::AddPoints(IPatternPointList* list, DacPosition start, DacStep step, std::int32_t count,
                                std::uint16_t dwellTicks, std::uint8_t flags, std::int32_t firstIndex) const {
    if (count < 0 || firstIndex < 0 || list == nullptr)
        ThrowInvalidArgument("Invalid arguments.");
    if (count == 0)
        return {start, firstIndex};
    const auto first = static_cast<std::uint32_t>(firstIndex);
    PointBufferView view(list, first, first + static_cast<std::uint32_t>(count));
    const PointRunEnd end = AddPoints(view.Points(), start, step, count, dwellTicks, flags, 0);
    return {end.endPosition, firstIndex + count};
}

std::int32_t CPattern::AddLeadInPoints(std::span<PatternPoint> points, DacPosition position,
                                       std::int32_t firstIndex) const {
    const std::int32_t preBlanking = GetPreBlankingPointCount();
    if (preBlanking == 0)
        return firstIndex;
    const double resolution = effectiveResolution_;
    const auto blankTicks = ToDwellTicks(settings_.preBlankingTime / preBlanking / resolution);
    std::int32_t next =
        AddPoints(points, position, {}, preBlanking, blankTicks, PointFlag_Blank, firstIndex).nextIndex;
    const std::int32_t asymmetry = GetStartAsymmetryPointCount();
    if (asymmetry == 0)
        return next;
    const auto asymmetryTicks = ToDwellTicks(settings_.patternStartAsymmetryTime / asymmetry / resolution);
    return AddPoints(points, position, {}, asymmetry, asymmetryTicks, 0, next).nextIndex;
}

std::int32_t CPattern::AddPostBlankingPoints(std::span<PatternPoint> points, DacPosition position,
                                             std::int32_t firstIndex) const {
    const std::int32_t postBlanking = GetPostBlankingPointCount();
    if (postBlanking == 0)
        return firstIndex;
    const auto ticks = ToDwellTicks(settings_.postBlankingTime / postBlanking / effectiveResolution_);
    return AddPoints(points, position, {}, postBlanking, ticks, PointFlag_Blank, firstIndex).nextIndex;
}

bool CPattern::HasTransformation() const {
    const auto& m = matrix_;
    constexpr double tolerance = 1e-9;
    return !(std::abs(m.m0 - 1.0) < tolerance && std::abs(m.m1) < tolerance && std::abs(m.m2) < tolerance &&
             std::abs(m.m3) < tolerance && std::abs(m.m4 - 1.0) < tolerance && std::abs(m.m5) < tolerance);
}

// Without offsets, truncating to 32 bits and then clamping to the DAC range gives exactly what clamping
// the mapped value does (both truncate toward zero, both give 0 for NaN), so that common case skips the
// intermediate integer.
void CPattern::TransformPoints(coordinate<double> center, std::span<PatternPoint> points,
                               DacPosition offset) const {
    if (!HasTransformation())
        return;
    const DacAffineMap map(settings_, matrix_, center);
    if (offset == DacPosition{}) {
        for (PatternPoint& point : points) {
            const coordinate<double> moved = map.Apply(point.x, point.y);
            StorePoint(&point, MakePoint(ClampToDac(moved.x), ClampToDac(moved.y), point.dwell, point.flags));
        }
        return;
    }
    for (PatternPoint& point : points) {
        const coordinate<double> moved = map.Apply(point.x + offset.x, point.y + offset.y);
        StorePoint(&point, MakePoint(ClampToDac(static_cast<double>(TruncToInt32(moved.x)) - offset.x),
                                     ClampToDac(static_cast<double>(TruncToInt32(moved.y)) - offset.y), point.dwell,
                                     point.flags));
    }
}

void CPattern::TransformPointList(coordinate<double> center, IPatternPointList* list) const {
    if (list == nullptr)
        ThrowInvalidArgument("PatternPointList object is null.");
    if (!HasTransformation())
        return;
    PointBufferView view(list);
    TransformPoints(center, view.Points());
}

void CPattern::TransformSubPatterns(coordinate<double> center, ISubPatternCollection* collection) const {
    if (collection == nullptr)
        ThrowInvalidArgument("SubPatternCollection object is null.");
    if (!HasTransformation())
        return;
    std::int32_t count = 0;
    CheckResult(collection->get_Count(&count));
    for (std::int32_t i = 0; i < count; ++i) {
        CComPtr<ISubPattern> subPattern;
        CheckResult(collection->Item(i, &subPattern));
        std::uint16_t offsetX = 0;
        std::uint16_t offsetY = 0;
        CComPtr<IPatternPointList> list;
        CheckResult(subPattern->get_OffsetX(&offsetX));
        CheckResult(subPattern->get_OffsetY(&offsetY));
        CheckResult(subPattern->get_PointList(&list));
        PointBufferView view(list);
        TransformPoints(center, view.Points(), {offsetX, offsetY});
    }
}

void CPattern::SetFieldOfView(ISubPatternCollection* collection) const {
    if (collection == nullptr)
        ThrowInvalidArgument("SubPatternCollection object is null.");
    const RectangleInt field{settings_.alignmentX.range.minimum, settings_.alignmentY.range.minimum,
                             settings_.alignmentX.range.maximum, settings_.alignmentY.range.maximum};
    CheckResult(collection->put_FieldOfView(CreateRectangleInt(field)));
}

RectangleFloat CPattern::GetPointsBoundingBox(std::span<const coordinate<double>> points) {
    RectangleFloat box{65535.0, 65535.0, 0.0, 0.0};
    for (const auto& p : points) {
        box.left = std::min(box.left, p.x);
        box.top = std::min(box.top, p.y);
        box.right = std::max(box.right, p.x);
        box.bottom = std::max(box.bottom, p.y);
    }
    return box;
}

RectangleInt CPattern::TransformedDacBox(coordinate<double> topLeft, coordinate<double> bottomRight) const {
    const auto& m = matrix_;
    const auto toDac = [&](coordinate<double> p) {
        return RelativeToDac(m.m0 * p.x + m.m1 * p.y + m.m2, m.m3 * p.x + m.m4 * p.y + m.m5);
    };
    const DacPosition a = toDac(topLeft);
    const DacPosition b = toDac(bottomRight);
    return {std::min(a.x, b.x), std::min(a.y, b.y), std::max(a.x, b.x), std::max(a.y, b.y)};
}

void CopyCommonPatternProperties(IPatternShape* from, IPatternShape* to) {
    CComPtr<IPatternRenderingProperties> properties;
    CheckResult(from->get_RenderingProperties(&properties));
    CheckResult(to->put_RenderingProperties(properties));
    double interval = 0.0;
    CheckResult(from->get_AcquisitionUpdateInterval(&interval));
    CheckResult(to->put_AcquisitionUpdateInterval(interval));
    VARIANT_BOOL gatePulse = VARIANT_FALSE;
    CheckResult(from->get_EnableGatePulse(&gatePulse));
    CheckResult(to->put_EnableGatePulse(gatePulse));
    ScanSynchronizationSource source{};
    CheckResult(from->get_ScanSynchronizationSource(&source));
    CheckResult(to->put_ScanSynchronizationSource(source));
}

CComPtr<IPatternPointList> CreatePointList(std::uint32_t count) {
    CComPtr<IPatternPointList> list = CreateInstance<IPatternPointList>(CLSID_PatternPointList);
    CheckResult(list->SetCount(count));
    return list;
}

CComPtr<ISubPatternCollection> CreateSubPatternCollection() {
    return CreateInstance<ISubPatternCollection>(CLSID_SubPatternCollection);
}

} // namespace Norvane::Lumis::Scanning

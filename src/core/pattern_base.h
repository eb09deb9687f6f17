// CPattern: the value-holding base of every pattern object, with the shared steps of rendering.
//
// It holds the pattern's copy of the rendering settings, its transformation matrix, the effective
// dwell time resolution and the scan-device configuration. The operations below are plain C++ over
// plain values and the point buffer; the concrete patterns call them while holding their own lock.
#pragma once

#include "core/point_buffer_view.h"
#include "core/rendering_settings.h"
#include "module/geometry_values.h"
#include "platform/com_ptr.h"

#include <beamweaver/dwellmap.h>
#include <beamweaver/pattern.h>

#include <cstdint>
#include <span>
#include <vector>

namespace Norvane::Lumis::Scanning {

// A DAC position (each axis within 0..65535 once written into a point).
struct DacPosition {
    std::int32_t x = 0;
    std::int32_t y = 0;
    friend constexpr bool operator==(const DacPosition&, const DacPosition&) = default;
};

// A DAC increment per point; fractional steps accumulate by repeated addition.
struct DacStep {
    double x = 0.0;
    double y = 0.0;
};

// Where a run of points ended: the position one step beyond its last point, and the next free index.
struct PointRunEnd {
    DacPosition endPosition;
    std::int32_t nextIndex = 0;
};

// A DAC coordinate as written into a point: truncated toward zero and clamped to 0..65535, so a
// position past either edge of the field stays on that edge instead of wrapping to the far side.
std::uint16_t ClampToDac(double value);

// A tick count as stored in a point: truncated toward zero and held within the 16-bit field (NaN gives 0),
// so a dwell too long for one point saturates instead of wrapping to a short one.
std::uint16_t ToDwellTicks(double ticks);

// trunc(value) as a 32-bit integer, saturating at the type's limits; NaN gives 0.
std::int32_t TruncToInt32(double value);

class CPattern {
  public:
    // Defaults, then the scan-device configuration from "ScanDevice.cfg" beside the program; a malformed
    // file throws (E_INVALIDARG, "Invalid configuration file") and the object is not created.
    CPattern();
    explicit CPattern(const ScanDeviceConfig& config);
    virtual ~CPattern() = default;
    CPattern(const CPattern&) = delete;
    CPattern& operator=(const CPattern&) = delete;

    const PatternRenderingSettings& GetRenderingSettings() const { return settings_; }
    // Replaces the settings as a whole, then lets the pattern react (OnRenderingSettingsChanged).
    void SetRenderingSettings(const PatternRenderingSettings& settings);
    const TransformationMatrix& GetTransformationMatrix() const { return matrix_; }
    void SetTransformationMatrix(const TransformationMatrix& matrix) { matrix_ = matrix; }
    const PatternAlignment& GetAlignmentX() const { return settings_.alignmentX; }
    const PatternAlignment& GetAlignmentY() const { return settings_.alignmentY; }
    double GetTargetDwellTimeResolution() const { return settings_.targetDwellTimeResolution; }
    double GetPreBlankingTime() const { return settings_.preBlankingTime; }
    double GetPostBlankingTime() const { return settings_.postBlankingTime; }
    double GetStartAsymmetryTime() const { return settings_.patternStartAsymmetryTime; }
    GenerationStrategy GetGenerationStrategy() const { return settings_.generationStrategy; }
    const ScanDeviceConfig& GetScanDeviceConfig() const { return config_; }

    // Effective resolution: the smallest power-of-two multiple of the device's dwell unit that fits the
    // longest dwell into MaximumDwellTimeFactor ticks, but never finer than the target resolution.
    void UpdateDwellTimeResolution(double maxDwellTime);
    double GetDwellTimeResolution() const { return effectiveResolution_; }
    // The longest dwell one point can carry: MaximumDwellTimeFactor ticks.
    double GetMaxPointDwellTime() const;
    // max(1, ceil(GatePulseIdleTime / resolution)).
    std::int32_t GetGatePulseIdleTicks() const;
    // PreBlankingTime + PatternStartAsymmetryTime when PreBlankingTime > 0, else 0.
    double GetPreBlankingTotalTime() const;

    // Blanking points: ceil(time / longest point dwell) when time >= resolution, else 0. The asymmetry
    // points exist only together with pre-blanking points.
    std::int32_t GetPreBlankingPointCount() const;
    std::int32_t GetStartAsymmetryPointCount() const;
    std::int32_t GetPostBlankingPointCount() const;
    std::int32_t GetLeadInPointCount() const;

    // Relative (0..1 over the field) to DAC: trunc(min + (max - min) * x) per axis, and back.
    DacPosition RelativeToDac(double x, double y) const;
    coordinate<double> DacToRelative(double x, double y) const;
    // A relative length as a whole number of DAC steps (truncated), and that length in relative units.
    std::int32_t RelativeToDacSpanX(double length) const;
    std::int32_t RelativeToDacSpanY(double length) const;
    double QuantizeRelativeX(double length) const;
    double QuantizeRelativeY(double length) const;

    // Writes count points into points[firstIndex, firstIndex + count): positions start, start + step, …
    // accumulated by repeated addition, each with the given dwell ticks and flags. Count 0 writes
    // nothing. Negative count or index, or a run past the end of the span, throw E_INVALIDARG
    // "Invalid arguments.".
    PointRunEnd AddPoints(std::span<PatternPoint> points, DacPosition start, DacStep step, std::int32_t count,
                          std::uint16_t dwellTicks, std::uint8_t flags, std::int32_t firstIndex) const;
    // The same on a point list (sized by the caller beforehand); a null list is an invalid argument.
    PointRunEnd AddPoints(IPatternPointList* list, DacPosition start, DacStep step, std::int32_t count,
                          std::uint16_t dwellTicks, std::uint8_t flags, std::int32_t firstIndex) const;

    // Pre-blanking points (blank) and then start-asymmetry points (no flags), all at position.
    std::int32_t AddLeadInPoints(std::span<PatternPoint> points, DacPosition position,
                                 std::int32_t firstIndex) const;
    // Post-blanking points (blank) at position.
    std::int32_t AddPostBlankingPoints(std::span<PatternPoint> points, DacPosition position,
                                       std::int32_t firstIndex) const;

    // Whether the matrix differs from the identity by at least 1e-9 in any coefficient.
    bool HasTransformation() const;
    // Maps every point through the matrix about center (relative coordinates); skipped for the identity.
    void TransformPoints(coordinate<double> center, std::span<PatternPoint> points,
                         DacPosition offset = {}) const;
    // The same on a point list; null fails with "PatternPointList object is null.".
    void TransformPointList(coordinate<double> center, IPatternPointList* list) const;
    // Every sub pattern of the collection, at its offsets; null fails with "SubPatternCollection object is
    // null.".
    void TransformSubPatterns(coordinate<double> center, ISubPatternCollection* collection) const;
    // Puts the DAC rectangle of the full field on the collection.
    void SetFieldOfView(ISubPatternCollection* collection) const;

    // (minX, minY, maxX, maxY) of the points, starting from (65535, 65535, 0, 0).
    static RectangleFloat GetPointsBoundingBox(std::span<const coordinate<double>> points);
    // The transformed relative rectangle (both corners about the origin) in DAC units, ordered.
    RectangleInt TransformedDacBox(coordinate<double> topLeft, coordinate<double> bottomRight) const;

  protected:
    virtual void OnRenderingSettingsChanged(const PatternRenderingSettings&) {}

  private:
    std::int32_t BlankingPointCount(double time) const;

    PatternRenderingSettings settings_;
    TransformationMatrix matrix_;
    double effectiveResolution_ = 2.5e-8;
    ScanDeviceConfig config_;
};

// Reads common properties from one pattern and puts them on another, in this order: RenderingProperties,
// AcquisitionUpdateInterval, EnableGatePulse, ScanSynchronizationSource.
void CopyCommonPatternProperties(IPatternShape* from, IPatternShape* to);

// A new point list of count zeroed points (from the point-list component).
CComPtr<IPatternPointList> CreatePointList(std::uint32_t count);
// A new sub-pattern collection (from the point-list component).
CComPtr<ISubPatternCollection> CreateSubPatternCollection();

} // namespace Norvane::Lumis::Scanning

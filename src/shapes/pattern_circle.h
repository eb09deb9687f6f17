// The circle pattern: a disc or annulus milled along concentric rings (circular strategy) or along
// serpentine lines clipped to the annulus (rectangular strategy), with a dwell running linearly from the
// inner to the outer radius. It also serves as an exclusion shape: it keeps a circle exclusion shape in
// step with its geometry and, marked as exclusion, renders blanked and registers that shape with its zone.
// Every member of its own holds the object's lock for its whole run.
#pragma once

#include "core/pattern_impl.h"
#include "platform/error_info.h"
#include "shapes/circle_generator.h"
#include "shapes/excludable_pattern_impl.h"

#include <beamweaver/circle.h>
#include <beamweaver/exclusion.h>

namespace Norvane::Lumis::Scanning {

class CPatternCircle : public ExcludablePatternImpl<IPatternCircle, IShapeCircle>,
                       public ICloneablePattern,
                       public ISupportErrorInfoImplEx<IPatternCircle, IPattern> {
  public:
    using Interfaces = InterfaceMap<IPatternCircle, IExclusionAwarePattern, IExcludablePatternShape,
                                    ICloneablePattern, ISupportErrorInfo>;

    // Creates the exclusion shape (class ShapeCircle) and brings it up to date; a failed creation fails
    // the construction.
    CPatternCircle();

    // The circular-scan form: one ring of about numberOfPoints points on radius around center, every point
    // with dwellTime (frame fill of a circular strategy with PitchT = radius × 2π / numberOfPoints). The
    // values are taken as given; a ring that cannot be laid out fails its render.
    CPatternCircle(coordinate<double> center, double radius, std::int32_t numberOfPoints, double dwellTime);

    // IPatternCircle
    HRESULT get_Center(ICoordinateFloat** value) override;
    HRESULT put_Center(ICoordinateFloat* value) override;
    HRESULT get_InnerRadius(double* value) override;
    HRESULT put_InnerRadius(double value) override;
    HRESULT get_OuterRadius(double* value) override;
    HRESULT put_OuterRadius(double value) override;
    HRESULT get_InnerDwellTime(double* value) override;
    HRESULT put_InnerDwellTime(double value) override;
    HRESULT get_OuterDwellTime(double* value) override;
    HRESULT put_OuterDwellTime(double value) override;
    HRESULT get_ScanStrategy(IScanStrategy** value) override;
    HRESULT put_ScanStrategy(IScanStrategy* value) override;
    HRESULT get_TransformationMatrix(ITransformationMatrix2D** value) override;
    HRESULT put_TransformationMatrix(ITransformationMatrix2D* value) override;
    HRESULT get_InnerCircleBlankingTime(double* value) override;
    HRESULT put_InnerCircleBlankingTime(double value) override;
    HRESULT GetEffectiveLoopTime(double* loopTime) override;

    // IPattern
    HRESULT Validate(IPatternValidationResult** result) override;
    HRESULT GetLoopTime(double* loopTime) override;
    HRESULT GetMinDwellTime(double* dwellTime) override;
    HRESULT GetMaxDwellTime(double* dwellTime) override;
    HRESULT GetDacBoundingBox(IRectangleInt** boundingBox) override;

    // IPatternShape
    HRESULT Accept(IPatternShapeVisitor* visitor) override;

    // ICloneablePattern
    HRESULT Clone(IPattern** clone) override;
    HRESULT CopyTo(IPattern* target) override;

  protected:
    CComPtr<IScanDefinition> RenderPattern() override;
    void OnRenderingSettingsChanged(const PatternRenderingSettings& settings) override;

  private:
    HRESULT PutRadius(double value, double CircleGeometry::*field);
    HRESULT PutDwellTime(double value, double CircleGeometry::*field);
    HRESULT AcceptCircularStrategy(IScanStrategyCircular* strategy);
    HRESULT AcceptRectangularStrategy(IScanStrategyRectangular* strategy);
    CComPtr<IScanStrategy> MakeStrategy() const;
    void UpdateResolutionForDwellTimes();
    CComPtr<IPatternValidationResult> MakeValidation();
    double EffectiveLoopTime();
    std::uint8_t PointFlags() const;
    // Sets the shape's Center, radii, TransformationMatrix, DACRangeX and DACRangeY from the pattern.
    void UpdateExclusionShape();
    void CopyCirclePropertiesTo(IPatternCircle* target);

    CircleGeometry circle_;
};

// A circle pattern in its circular-scan form (see its constructor).
CComPtr<IPatternCircle> CreateCircularScanPattern(coordinate<double> center, double radius,
                                                  std::int32_t numberOfPoints, double dwellTime);

} // namespace Norvane::Lumis::Scanning

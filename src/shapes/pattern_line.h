// The line pattern: a row of equally spaced exposure points from Begin to End with a linear dwell
// ramp, optionally scanned there and back again. Every member holds the object's lock for its whole run.
#pragma once

#include "core/pattern_impl.h"
#include "platform/error_info.h"
#include "shapes/line_generator.h"

#include <beamweaver/shapes.h>

namespace Norvane::Lumis::Scanning {

class CPatternLine : public IPatternShapeImpl<IPatternLine>,
                     public ICloneablePattern,
                     public ISupportErrorInfoImplEx<IPatternLine, IPattern> {
  public:
    using Interfaces =
        InterfaceMap<IPatternLine, IExclusionAwarePattern, ICloneablePattern, ISupportErrorInfo>;

    CPatternLine();

    // IPatternLine
    HRESULT get_Begin(ICoordinateFloat** value) override;
    HRESULT put_Begin(ICoordinateFloat* value) override;
    HRESULT get_End(ICoordinateFloat** value) override;
    HRESULT put_End(ICoordinateFloat* value) override;
    HRESULT get_BeginDwellTime(double* value) override;
    HRESULT put_BeginDwellTime(double value) override;
    HRESULT get_EndDwellTime(double* value) override;
    HRESULT put_EndDwellTime(double value) override;
    HRESULT get_Pitch(double* value) override;
    HRESULT put_Pitch(double value) override;
    HRESULT get_ScanDirection(ScanDirection* value) override;
    HRESULT put_ScanDirection(ScanDirection value) override;
    HRESULT get_TransformationMatrix(ITransformationMatrix2D** value) override;
    HRESULT put_TransformationMatrix(ITransformationMatrix2D* value) override;
    HRESULT get_MultiPass(MultiPass* value) override;
    HRESULT put_MultiPass(MultiPass value) override;
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

  private:
    // Stores a dwell time in field and recomputes the resolution; refuses what is not a positive, finite
    // time.
    HRESULT PutDwellTime(double value, double LineGeometry::*field);
    void UpdateResolutionForDwellTimes();
    CComPtr<IPatternValidationResult> MakeValidation();
    double EffectiveLoopTime();
    void CopyLinePropertiesTo(IPatternLine* target);

    LineGeometry line_;
};

} // namespace Norvane::Lumis::Scanning

// The rectangle pattern: a rectangle milled line by line (solid fill) or along its outline (frame fill)
// under a rectangular scan strategy, with a dwell ramping from BeginDwellTime on the first line to
// EndDwellTime on the last. It also serves as an exclusion shape: it keeps a rectangle exclusion shape in
// step with its geometry and, marked as exclusion, renders blanked and registers that shape with its zone.
// Every member of its own holds the object's lock for its whole run.
#pragma once

#include "core/pattern_impl.h"
#include "platform/error_info.h"
#include "shapes/rectangle_generator.h"
#include "shapes/rectangular_fill_pattern_impl.h"

#include <beamweaver/exclusion.h>
#include <beamweaver/shapes.h>

namespace Norvane::Lumis::Scanning {

class CPatternRectangle
    : public RectangularFillPatternImpl<IPatternRectangle, IShapeRectangle, RectangleGeometry>,
      public ICloneablePattern,
      public ISupportErrorInfoImplEx<IPatternRectangle, IPattern> {
  public:
    using Interfaces = InterfaceMap<IPatternRectangle, IExclusionAwarePattern, IExcludablePatternShape,
                                    ICloneablePattern, ISupportErrorInfo>;

    // Creates the exclusion shape (class ShapeRectangle) and brings it up to date; a failed creation
    // fails the construction.
    CPatternRectangle();

    // IPatternRectangle
    HRESULT get_Rectangle(IRectangleFloat** value) override;
    HRESULT put_Rectangle(IRectangleFloat* value) override;
    HRESULT GetEffectiveLoopTime(double* loopTime) override;

    // IPattern
    HRESULT Validate(IPatternValidationResult** result) override;
    HRESULT GetLoopTime(double* loopTime) override;
    HRESULT GetDacBoundingBox(IRectangleInt** boundingBox) override;

    // IPatternShape
    HRESULT Accept(IPatternShapeVisitor* visitor) override;

    // ICloneablePattern
    HRESULT Clone(IPattern** clone) override;
    HRESULT CopyTo(IPattern* target) override;

  protected:
    // Sets the shape's geometry, TransformationMatrix, DACRangeX and DACRangeY from the pattern.
    void UpdateExclusionShape() override;
    CComPtr<IScanDefinition> RenderPattern() override;
    void OnRenderingSettingsChanged(const PatternRenderingSettings& settings) override;

  private:
    CComPtr<IPatternValidationResult> MakeValidation();
    double EffectiveLoopTime();
    std::uint8_t PointFlags() const;
    void CopyRectanglePropertiesTo(IPatternRectangle* target);
};

} // namespace Norvane::Lumis::Scanning

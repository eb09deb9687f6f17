// The polygon pattern: an arbitrary (also concave) polygon milled by scan lines (solid fill) or along its
// outline (frame fill) under a rectangular scan strategy, with a dwell stepping per scan line from
// BeginDwellTime to EndDwellTime. It also serves as an exclusion shape: it keeps a polygon exclusion shape
// in step with its vertices and geometry and, marked as exclusion, renders blanked and registers that
// shape with its zone. Every member of its own holds the object's lock for its whole run.
#pragma once

#include "core/pattern_impl.h"
#include "platform/error_info.h"
#include "shapes/polygon_generator.h"
#include "shapes/rectangular_fill_pattern_impl.h"

#include <beamweaver/exclusion.h>
#include <beamweaver/polygon.h>

namespace Norvane::Lumis::Scanning {

class CPatternPolygon : public RectangularFillPatternImpl<IPatternPolygon, IShapePolygon, PolygonGeometry>,
                        public ICloneablePattern,
                        public ISupportErrorInfoImplEx<IPatternPolygon, IPattern> {
  public:
    using Interfaces = InterfaceMap<IPatternPolygon, IExclusionAwarePattern, IExcludablePatternShape,
                                    ICloneablePattern, ISupportErrorInfo>;

    // Creates the exclusion shape (class ShapePolygon) and brings it up to date; a failed creation fails
    // the construction.
    CPatternPolygon();

    // IPatternPolygon
    HRESULT AddPoint(ICoordinateFloat* point) override;
    HRESULT ModifyPoint(std::int32_t index, ICoordinateFloat* point) override;
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
    void CopyPolygonPropertiesTo(IPatternPolygon* target);
};

} // namespace Norvane::Lumis::Scanning

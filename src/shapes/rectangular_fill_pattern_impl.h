// What the rectangle and polygon patterns share: a dwell ramp from BeginDwellTime to EndDwellTime, a
// rectangular scan strategy and a transformation matrix, with the same checks on each.
#pragma once

#include "core/scan_strategy_conversions.h"
#include "module/geometry_io.h"
#include "shapes/excludable_pattern_impl.h"

#include <algorithm>
#include <cmath>

namespace Norvane::Lumis::Scanning {

// A pitch strictly inside the field, in relative units.
inline bool IsRelativePitch(double value) {
    return value > 0.0 && value < 1.0;
}

// Geometry holds beginDwellTime, endDwellTime and strategy (a RectangularStrategy) besides its own shape.
template <class I, class S, class Geometry>
class RectangularFillPatternImpl : public ExcludablePatternImpl<I, S> {
  public:
    using ExcludablePatternImpl<I, S>::ExcludablePatternImpl;

    HRESULT get_BeginDwellTime(double* value) override {
        return Guarded(I::iid, this->Mutex(), value, [&] { *value = geometry_.beginDwellTime; });
    }
    HRESULT put_BeginDwellTime(double value) override {
        return PutDwellTime(value, &Geometry::beginDwellTime);
    }
    HRESULT get_EndDwellTime(double* value) override {
        return Guarded(I::iid, this->Mutex(), value, [&] { *value = geometry_.endDwellTime; });
    }
    HRESULT put_EndDwellTime(double value) override { return PutDwellTime(value, &Geometry::endDwellTime); }

    HRESULT get_ScanStrategy(IScanStrategyRectangular** value) override {
        return Guarded(I::iid, this->Mutex(), value,
                       [&] { *value = MakeScanStrategyRectangular(geometry_.strategy).Detach(); });
    }
    // Pitches must lie strictly within the field; the enumerations are kept as given and dealt with when
    // rendering.
    HRESULT put_ScanStrategy(IScanStrategyRectangular* value) override {
        return Guarded(I::iid, this->Mutex(), [&] {
            const RectangularStrategy strategy = ReadScanStrategyRectangular(value);
            if (!(IsRelativePitch(strategy.pitchX) && IsRelativePitch(strategy.pitchY)))
                return E_INVALIDARG;
            geometry_.strategy = strategy;
            return S_OK;
        });
    }

    HRESULT get_TransformationMatrix(ITransformationMatrix2D** value) override {
        return Guarded(I::iid, this->Mutex(), value,
                       [&] { *value = CreateMatrix(this->GetTransformationMatrix()).Detach(); });
    }
    HRESULT put_TransformationMatrix(ITransformationMatrix2D* value) override {
        return Guarded(I::iid, this->Mutex(), [&] {
            this->SetTransformationMatrix(ReadMatrixProperty(value, "TransformationMatrix"));
            UpdateExclusionShape();
        });
    }

    HRESULT GetMinDwellTime(double* dwellTime) override {
        return Guarded(I::iid, this->Mutex(), dwellTime,
                       [&] { *dwellTime = std::min(geometry_.beginDwellTime, geometry_.endDwellTime); });
    }
    HRESULT GetMaxDwellTime(double* dwellTime) override {
        return Guarded(I::iid, this->Mutex(), dwellTime,
                       [&] { *dwellTime = std::max(geometry_.beginDwellTime, geometry_.endDwellTime); });
    }

  protected:
    // Brings the exclusion shape in step with the pattern's geometry, matrix and alignments.
    virtual void UpdateExclusionShape() = 0;

    void UpdateResolutionForDwellTimes() {
        this->UpdateDwellTimeResolution(std::max(geometry_.beginDwellTime, geometry_.endDwellTime));
    }

    Geometry geometry_;

  private:
    // Stores a dwell time and recomputes the resolution; refuses what is not a positive, finite time.
    HRESULT PutDwellTime(double value, double Geometry::*field) {
        return Guarded(I::iid, this->Mutex(), [&] {
            if (!(value > 0.0 && std::isfinite(value)))
                return E_INVALIDARG;
            geometry_.*field = value;
            UpdateResolutionForDwellTimes();
            return S_OK;
        });
    }
};

} // namespace Norvane::Lumis::Scanning

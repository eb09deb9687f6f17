// The generic members of every pattern object: IPattern's shared members, exclusion-aware rendering,
// and the pieces of the render pipeline that a concrete pattern's RenderPattern calls.
//
// A concrete pattern derives from IPatternShapeImpl<IPatternX> (or IPatternImpl<IPatternX> when it is
// not a shape), supplies its own properties, Validate, loop times, bounding box and RenderPattern, and
// declares its interface map (listing IExclusionAwarePattern where the class exposes it).
#pragma once

#include "core/pattern_base.h"
#include "core/rendering_conversions.h"
#include "core/scan_definition_factory.h"
#include "core/validation.h"
#include "module/method_guard.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <atomic>
#include <mutex>

namespace Norvane::Lumis::Scanning {

// Throws E_INVALIDARG with the validation description when the result is not valid.
void ThrowIfInvalid(IPatternValidationResult* result);

// Runs the filter over every sub pattern of the scan definition, at each sub pattern's offsets.
void FilterScanDefinition(IScanDefinition* scanDefinition, IPatternPointFilter* filter);

template <class I>
class IPatternImpl : public CComObjectRootBase,
                     public IDispatchImpl<I>,
                     public IExclusionAwarePattern,
                     public CPattern {
  public:
    explicit IPatternImpl(const CLSID& clsid) : clsid_(clsid) {}
    IPatternImpl(const CLSID& clsid, const ScanDeviceConfig& config) : CPattern(config), clsid_(clsid) {}

    HRESULT ClassID(GUID* clsid) override {
        return Guarded(I::iid, clsid, [&] { *clsid = clsid_; });
    }
    HRESULT Render(IScanDefinition** scanDefinition) override {
        if (scanDefinition == nullptr)
            return E_POINTER;
        CComPtr<IPatternPointFilter> filter;
        if (CComPtr<IExclusionZone> zone = StoredExclusionZone()) {
            const HRESULT hr = zone.QueryInterface(&filter);
            if (FAILED(hr))
                return hr;
        }
        return RenderWithExclusion(filter, scanDefinition);
    }
    using CPattern::GetDwellTimeResolution;
    HRESULT GetDwellTimeResolution(double* resolution) override {
        return Guarded(I::iid, mutex_, resolution, [&] { *resolution = CPattern::GetDwellTimeResolution(); });
    }
    HRESULT get_AcquisitionUpdateInterval(double* value) override {
        return Guarded(I::iid, value, [&] { *value = acquisitionUpdateInterval_.load(); });
    }
    HRESULT put_AcquisitionUpdateInterval(double value) override {
        acquisitionUpdateInterval_.store(value);
        return S_OK;
    }
    HRESULT get_EnableGatePulse(VARIANT_BOOL* value) override {
        return Guarded(I::iid, value, [&] { *value = ToVariantBool(enableGatePulse_.load()); });
    }
    HRESULT put_EnableGatePulse(VARIANT_BOOL value) override {
        enableGatePulse_.store(value != 0);
        return S_OK;
    }
    HRESULT get_ScanSynchronizationSource(ScanSynchronizationSource* value) override {
        return Guarded(I::iid, value, [&] { *value = synchronizationSource_.load(); });
    }
    HRESULT put_ScanSynchronizationSource(ScanSynchronizationSource value) override {
        synchronizationSource_.store(value);
        return S_OK;
    }

    HRESULT RenderWithExclusion(IPatternPointFilter* filter, IScanDefinition** scanDefinition) override {
        return Guarded(IExclusionAwarePattern::iid, scanDefinition, [&] {
            CComPtr<IScanDefinition> rendered = RenderPattern();
            if (filter != nullptr)
                FilterScanDefinition(rendered, filter);
            *scanDefinition = rendered.Detach();
        });
    }
    HRESULT SetExclusionZone(IExclusionZone* zone) override {
        return Guarded(IExclusionAwarePattern::iid, [&] {
            {
                std::lock_guard lock(zoneMutex_);
                zone_ = zone;
            }
            OnExclusionZoneSet(zone);
        });
    }
    HRESULT ClearExclusionZone() override {
        return Guarded(IExclusionAwarePattern::iid, [&] {
            OnExclusionZoneCleared();
            std::lock_guard lock(zoneMutex_);
            zone_.Release();
        });
    }

  protected:
    // Validates, generates and packages the pattern's points; holds the object's lock while it runs.
    virtual CComPtr<IScanDefinition> RenderPattern() = 0;
    virtual void OnExclusionZoneSet(IExclusionZone*) {}
    virtual void OnExclusionZoneCleared() {}

    ObjectMutex& Mutex() { return mutex_; }
    bool GatePulseEnabled() const { return enableGatePulse_.load(); }
    double AcquisitionUpdateInterval() const { return acquisitionUpdateInterval_.load(); }

    // Calls the object's own Validate and throws its description when the pattern is not valid.
    void ValidateOrThrow() {
        CComPtr<IPatternValidationResult> result;
        CheckResult(static_cast<I*>(this)->Validate(&result));
        ThrowIfInvalid(result);
    }

    // Steps after the points are written and transformed: a collection with the field of view and the
    // resolution holding the list as its one sub pattern, and the scan definition around it. meanDwell
    // is the pattern's mean point dwell, which sets the points per acquisition update.
    CComPtr<IScanDefinition> PackageShapeRendering(IPatternPointList* list, double meanDwell) {
        CComPtr<ISubPatternCollection> collection = CreateSubPatternCollection();
        SetFieldOfView(collection);
        CheckResult(collection->put_DwellTimeResolution(CPattern::GetDwellTimeResolution()));
        CheckResult(collection->Add(list, 0, 0, 0, 1));
        const auto gateTicks = GatePulseEnabled() ? static_cast<std::uint32_t>(GetGatePulseIdleTicks()) : 0u;
        return CreatePatternScanDefinition(collection, ScanSynchronizationSource{}, gateTicks,
                                           AcquisitionUpdatePoints(meanDwell), false, false);
    }

    CComPtr<IExclusionZone> StoredExclusionZone() {
        std::lock_guard lock(zoneMutex_);
        return zone_;
    }

  private:
    std::uint32_t AcquisitionUpdatePoints(double meanDwell) const;

    CLSID clsid_;
    ObjectMutex mutex_;
    std::atomic<double> acquisitionUpdateInterval_{1.0 / 60.0};
    std::atomic<bool> enableGatePulse_{false};
    std::atomic<ScanSynchronizationSource> synchronizationSource_{ScanSynchronizationSource{}};
    std::mutex zoneMutex_;
    CComPtr<IExclusionZone> zone_;
};

// trunc(interval / meanDwell) as a 32-bit count; saturates instead of wrapping, 0 for no dwell.
std::uint32_t PointsPerInterval(double interval, double meanDwell);

template <class I> std::uint32_t IPatternImpl<I>::AcquisitionUpdatePoints(double meanDwell) const {
    return PointsPerInterval(AcquisitionUpdateInterval(), meanDwell);
}

// Adds the rendering properties of a shape pattern.
template <class I> class IPatternShapeImpl : public IPatternImpl<I> {
  public:
    using IPatternImpl<I>::IPatternImpl;

    HRESULT get_RenderingProperties(IPatternRenderingProperties** value) override {
        return Guarded(I::iid, this->Mutex(), value, [&] {
            *value = MakePatternRenderingProperties(this->GetRenderingSettings()).Detach();
        });
    }
    HRESULT put_RenderingProperties(IPatternRenderingProperties* value) override {
        return Guarded(I::iid, this->Mutex(),
                       [&] { this->SetRenderingSettings(ReadPatternRenderingProperties(value)); });
    }
};

} // namespace Norvane::Lumis::Scanning

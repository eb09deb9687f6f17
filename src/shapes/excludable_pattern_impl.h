// What the rectangle, circle and polygon patterns share as exclusion shapes: the exclusion shape they keep
// in step with their geometry, the IsExclusion mark, and keeping that shape in the stored zone.
#pragma once

#include "core/pattern_impl.h"
#include "module/create_instance.h"

#include <beamweaver/exclusion.h>

namespace Norvane::Lumis::Scanning {

// I is the pattern's interface, S the interface of its exclusion shape (created by class id with the object).
template <class I, class S>
class ExcludablePatternImpl : public IPatternShapeImpl<I>, public IExcludablePatternShape {
  public:
    ExcludablePatternImpl(const CLSID& clsid, const CLSID& shapeClsid)
        : IPatternShapeImpl<I>(clsid), shape_(CreateInstance<S>(shapeClsid)) {}

    HRESULT get_IsExclusion(VARIANT_BOOL* value) override {
        return Guarded(IID_IExcludablePatternShape, this->Mutex(), value,
                       [&] { *value = ToVariantBool(isExclusion_); });
    }

    HRESULT put_IsExclusion(VARIANT_BOOL value) override {
        return Guarded(IID_IExcludablePatternShape, this->Mutex(), [&] {
            isExclusion_ = value != 0;
            UpdateZoneMembership();
        });
    }

    // The shape is made with the object and never replaced, so handing it out takes no lock; a zone that
    // asks a pattern for its shape while holding its own lock cannot wait on this one.
    HRESULT get_Shape(IShape** value) override {
        return Guarded(IID_IExcludablePatternShape, value, [&] {
            *value = ExclusionShape();
            (*value)->AddRef();
        });
    }

  protected:
    void OnExclusionZoneSet(IExclusionZone* zone) override {
        boost::unique_lock<ObjectMutex> lock(this->Mutex());
        if (zone != nullptr && isExclusion_)
            CheckResult(zone->AddShape(ExclusionShape()));
    }

    void OnExclusionZoneCleared() override {
        boost::unique_lock<ObjectMutex> lock(this->Mutex());
        if (CComPtr<IExclusionZone> zone = this->StoredExclusionZone())
            CheckResult(zone->RemoveShape(ExclusionShape()));
    }

    bool IsExclusion() const { return isExclusion_; }
    S* Shape() const { return shape_.Get(); }
    IShape* ExclusionShape() const { return shape_.Get(); }

  private:
    // Puts the shape into the stored zone unless it is there already, or takes it out.
    void UpdateZoneMembership() {
        CComPtr<IExclusionZone> zone = this->StoredExclusionZone();
        if (!zone)
            return;
        if (!isExclusion_) {
            CheckResult(zone->RemoveShape(ExclusionShape()));
            return;
        }
        VARIANT_BOOL contained = VARIANT_FALSE;
        CheckResult(zone->ContainsShape(ExclusionShape(), &contained));
        if (contained == VARIANT_FALSE)
            CheckResult(zone->AddShape(ExclusionShape()));
    }

    bool isExclusion_ = false;
    CComPtr<S> shape_;
};

} // namespace Norvane::Lumis::Scanning

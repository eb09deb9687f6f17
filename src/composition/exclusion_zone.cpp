#include "composition/exclusion_zone.h"

#include "module/create_instance.h"
#include "module/error_reporting.h"

#include <algorithm>
#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

void RequireShape(IShape* shape) {
    if (shape == nullptr)
        throw std::invalid_argument("Shape object is null");
}

} // namespace

HRESULT CExclusionZone::AddShape(IShape* shape) {
    return Guarded(IID_IExclusionZone, mutex_, [&] {
        RequireShape(shape);
        shapes_.emplace_back(shape);
    });
}

HRESULT CExclusionZone::RemoveShape(IShape* shape) {
    return Guarded(IID_IExclusionZone, mutex_, [&] {
        RequireShape(shape);
        const auto found =
            std::ranges::find(shapes_, shape, [](const CComPtr<IShape>& held) { return held.Get(); });
        if (found != shapes_.end())
            shapes_.erase(found);
    });
}

HRESULT CExclusionZone::ContainsShape(IShape* shape, VARIANT_BOOL* contained) {
    return Guarded(IID_IExclusionZone, mutex_, contained, [&] {
        RequireShape(shape);
        const bool held =
            std::ranges::any_of(shapes_, [&](const CComPtr<IShape>& entry) { return entry.Get() == shape; });
        *contained = held ? VARIANT_TRUE : VARIANT_FALSE;
    });
}

HRESULT CExclusionZone::AddShapeFromPatternShape(IExcludablePatternShape* patternShape) {
    return Guarded(IID_IExclusionZone, mutex_, [&] {
        if (patternShape == nullptr)
            throw std::invalid_argument("PatternShape object is null");
        CComPtr<IShape> shape;
        CheckResult(patternShape->get_Shape(&shape));
        CheckResult(AddShape(shape));
    });
}

HRESULT CExclusionZone::Clear() {
    return Guarded(IID_IExclusionZone, mutex_, [&] { shapes_.clear(); });
}

HRESULT CExclusionZone::Clone(IExclusionZone** clone) {
    return Guarded(IID_IExclusionZone, mutex_, clone, [&] {
        CComPtr<IExclusionZone> zone = CreateInstance<IExclusionZone>(CLSID_ExclusionZone);
        CopyShapesTo(zone);
        *clone = zone.Detach();
    });
}

HRESULT CExclusionZone::CopyTo(IExclusionZone* target) {
    return Guarded(IID_IExclusionZone, mutex_, [&] {
        if (target == nullptr)
            throw std::invalid_argument("pIExclusionZone object is null");
        CopyShapesTo(target);
    });
}

HRESULT CExclusionZone::FilterList(IPatternPointList* list) {
    return Guarded(IID_IPatternPointFilter, mutex_, [&] {
        ForEachFilter([&](IPatternPointFilter* filter) { return filter->FilterList(list); });
    });
}

HRESULT CExclusionZone::FilterListWithOffset(IPatternPointList* list, std::uint16_t offsetX,
                                             std::uint16_t offsetY) {
    return Guarded(IID_IPatternPointFilter, mutex_, [&] {
        ForEachFilter([&](IPatternPointFilter* filter) {
            return filter->FilterListWithOffset(list, offsetX, offsetY);
        });
    });
}

// Indexed with the count taken first: copying a zone into itself appends clones of the shapes it held
// when the copy began, and never walks a vector that is growing underneath.
void CExclusionZone::CopyShapesTo(IExclusionZone* target) {
    const std::size_t count = shapes_.size();
    for (std::size_t i = 0; i < count; ++i) {
        const CComPtr<IShape> shape = shapes_[i];
        CComPtr<IShape> copy;
        CheckResult(shape->Clone(&copy));
        CheckResult(target->AddShape(copy));
    }
}

// Each shape is held for the length of its call, so a shape that changes the zone from inside its filter
// cannot pull itself or the array out from under the loop.
template <class Filter> void CExclusionZone::ForEachFilter(Filter&& filter) {
    for (std::size_t i = 0; i < shapes_.size(); ++i) {
        const CComPtr<IShape> shape = shapes_[i];
        if (const auto pointFilter = QueryAs<IPatternPointFilter>(shape.Get()))
            CheckResult(filter(pointFilter.Get()));
    }
}

} // namespace Norvane::Lumis::Scanning

#include "dwellmap/sub_pattern_collection.h"

#include "dwellmap/point_list_view.h"
#include "dwellmap/sub_pattern.h"
#include "module/geometry_io.h"

#include <cmath>
#include <limits>
#include <stdexcept>

namespace Norvane::Dwellmap {

HRESULT CSubPatternCollection::Item(std::int32_t index, ISubPattern** item) {
    return Guarded(IID_ISubPatternCollection, mutex_, item, [&] {
        *item = nullptr;
        if (index < 0 || static_cast<std::size_t>(index) >= entries_.size())
            return E_INVALIDARG;
        *item =
            CComObjectEx<CSubPattern>::CreateInstance<ISubPattern>(entries_[static_cast<std::size_t>(index)])
                .Detach();
        return S_OK;
    });
}

HRESULT CSubPatternCollection::get_Count(std::int32_t* count) {
    return Guarded(IID_ISubPatternCollection, mutex_, count,
                   [&] { *count = static_cast<std::int32_t>(entries_.size()); });
}

HRESULT CSubPatternCollection::Add(IPatternPointList* pointList, std::int32_t value, std::uint16_t offsetX,
                                   std::uint16_t offsetY, std::uint32_t repeatCount) {
    return Guarded(IID_ISubPatternCollection, mutex_, [&] {
        if (pointList == nullptr)
            throw HResultException(E_INVALIDARG, "pointList object is null");
        entries_.push_back(SubPatternEntry{pointList, value, offsetX, offsetY, repeatCount});
    });
}

HRESULT CSubPatternCollection::get_DwellTimeResolution(double* value) {
    return Guarded(IID_ISubPatternCollection, mutex_, value, [&] { *value = dwellTimeResolution_; });
}

HRESULT CSubPatternCollection::put_DwellTimeResolution(double value) {
    if (!std::isfinite(value) || value < 0.0)
        return E_INVALIDARG;
    return Guarded(IID_ISubPatternCollection, mutex_, [&] { dwellTimeResolution_ = value; });
}

HRESULT CSubPatternCollection::get_MinimumDwellTicks(std::uint16_t* value) {
    return Guarded(IID_ISubPatternCollection, mutex_, value, [&] { *value = ScanDwellTicks().Minimum(); });
}

HRESULT CSubPatternCollection::get_MaximumDwellTicks(std::uint16_t* value) {
    return Guarded(IID_ISubPatternCollection, mutex_, value, [&] { *value = ScanDwellTicks().Maximum(); });
}

HRESULT CSubPatternCollection::get_TotalPointCount(std::uint32_t* value) {
    return Guarded(IID_ISubPatternCollection, mutex_, value, [&] {
        std::uint64_t total = 0;
        for (const SubPatternEntry& entry : entries_)
            total += PointCountOf(entry.pointList);
        if (total > std::numeric_limits<std::uint32_t>::max())
            throw std::overflow_error("TotalPointCount exceeds 4294967295 points");
        *value = static_cast<std::uint32_t>(total);
    });
}

HRESULT CSubPatternCollection::get_FieldOfView(IRectangleInt** value) {
    return Guarded(IID_ISubPatternCollection, mutex_, value, [&] {
        *value = nullptr;
        *value = Lumis::CreateRectangleInt(fieldOfView_).Detach();
    });
}

HRESULT CSubPatternCollection::put_FieldOfView(IRectangleInt* value) {
    return Guarded(IID_ISubPatternCollection, mutex_, [&] {
        if (value == nullptr)
            throw HResultException(E_INVALIDARG, "FieldOfView object is null");
        fieldOfView_ = Lumis::ReadRectangleInt(value);
    });
}

DwellTickRange CSubPatternCollection::ScanDwellTicks() const {
    DwellTickRange range;
    for (const SubPatternEntry& entry : entries_)
        range.Include(PointListView(entry.pointList).Points());
    return range;
}

} // namespace Norvane::Dwellmap

// The sub-pattern collection: sub patterns in playing order plus the values shared by all of them.
//
// Clients may share a collection between threads, so every member runs under the object's lock. The
// point lists are held by reference, as added; their points are read through the lists' own interfaces.
#pragma once

#include "dwellmap/dwell_tick_range.h"
#include "dwellmap/sub_pattern_entry.h"
#include "module/geometry_values.h"
#include "module/method_guard.h"
#include "platform/dispatch_impl.h"
#include "platform/error_info.h"
#include "platform/object.h"

#include <beamweaver/dwellmap.h>

#include <vector>

namespace Norvane::Dwellmap {

class CSubPatternCollection : public CComObjectRootBase,
                              public IDispatchImpl<ISubPatternCollection>,
                              public ISupportErrorInfoImplEx<ISubPatternCollection> {
  public:
    using Interfaces = InterfaceMap<ISubPatternCollection, ISupportErrorInfo>;

    HRESULT Item(std::int32_t index, ISubPattern** item) override;
    HRESULT get_Count(std::int32_t* count) override;
    HRESULT Add(IPatternPointList* pointList, std::int32_t value, std::uint16_t offsetX,
                std::uint16_t offsetY, std::uint32_t repeatCount) override;
    // 0.0 until set (no resolution known); puts take finite values from 0.0 up.
    HRESULT get_DwellTimeResolution(double* value) override;
    HRESULT put_DwellTimeResolution(double value) override;
    HRESULT get_MinimumDwellTicks(std::uint16_t* value) override;
    HRESULT get_MaximumDwellTicks(std::uint16_t* value) override;
    // The sum of the lists' counts; a sum beyond the 32-bit range fails rather than wrapping.
    HRESULT get_TotalPointCount(std::uint32_t* value) override;
    // A copy in and a new object out; (0, 0, 0, 0) until set.
    HRESULT get_FieldOfView(IRectangleInt** value) override;
    HRESULT put_FieldOfView(IRectangleInt* value) override;

  private:
    DwellTickRange ScanDwellTicks() const;

    mutable ObjectMutex mutex_;
    std::vector<SubPatternEntry> entries_;
    double dwellTimeResolution_ = 0.0;
    Lumis::RectangleInt fieldOfView_;
};

} // namespace Norvane::Dwellmap

// The point list: one contiguous block of point records that a rendering sizes once and then fills in
// place through a point buffer.
//
// The list takes no lock. It is used by one rendering at a time: the rendering that creates it fills it
// before handing it to a collection, and filters work on it only after that rendering has finished.
#pragma once

#include "dwellmap/point_storage.h"
#include "platform/dispatch_impl.h"
#include "platform/error_info.h"
#include "platform/object.h"

#include <beamweaver/dwellmap.h>

namespace Norvane::Dwellmap {

class CPatternPointList : public CComObjectRootBase,
                          public IDispatchImpl<IPatternPointList>,
                          public IPatternPointListCount,
                          public ISupportErrorInfoImplEx<IPatternPointList, IPatternPointListCount> {
  public:
    using Interfaces = InterfaceMap<IPatternPointList, IPatternPointListCount, ISupportErrorInfo>;

    // The largest count that GetCount can report.
    static constexpr std::uint32_t kMaximumCount = 0x7FFFFFFF;

    HRESULT GetCount(std::int32_t* count) override;
    HRESULT SetCount(std::uint32_t count) override;
    HRESULT GetPointBuffer(IPatternPointBuffer** buffer) override;

    HRESULT SetPointCount(std::uint32_t count) override;

  private:
    PointStorage storage_;
};

} // namespace Norvane::Dwellmap

// One sub pattern as a collection hands it out: an immutable view of its entry, so it takes no lock.
#pragma once

#include "dwellmap/sub_pattern_entry.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/dwellmap.h>

namespace Norvane::Dwellmap {

class CSubPattern : public CComObjectRootBase, public IDispatchImpl<ISubPattern> {
  public:
    using Interfaces = InterfaceMap<ISubPattern>;

    explicit CSubPattern(SubPatternEntry entry);

    HRESULT get_PointList(IPatternPointList** value) override;
    HRESULT get_Value(std::int32_t* value) override;
    HRESULT get_OffsetX(std::uint16_t* value) override;
    HRESULT get_OffsetY(std::uint16_t* value) override;
    HRESULT get_RepeatCount(std::uint32_t* value) override;

  private:
    const SubPatternEntry entry_;
};

} // namespace Norvane::Dwellmap

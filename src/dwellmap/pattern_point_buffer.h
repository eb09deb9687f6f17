// Write access to a point list's records. The buffer holds a reference to its list and pins the list's
// storage, so every range it hands out stays the list's own memory until the buffer is released.
#pragma once

#include "dwellmap/point_storage.h"
#include "platform/object.h"

#include <beamweaver/dwellmap.h>

namespace Norvane::Dwellmap {

class CPatternPointBuffer : public CComObjectRootBase, public IPatternPointBuffer {
  public:
    using Interfaces = InterfaceMap<IPatternPointBuffer>;

    CPatternPointBuffer(IPatternPointList* list, PointStorage& storage);
    ~CPatternPointBuffer();
    CPatternPointBuffer(const CPatternPointBuffer&) = delete;
    CPatternPointBuffer& operator=(const CPatternPointBuffer&) = delete;

    HRESULT GetRange(std::uint32_t first, std::uint32_t last, PatternPoint** begin,
                     PatternPoint** end) override;

  private:
    CComPtr<IPatternPointList> list_;
    PointStorage& storage_;
};

} // namespace Norvane::Dwellmap

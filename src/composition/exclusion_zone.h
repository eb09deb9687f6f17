// The exclusion zone: an ordered set of shapes (held by reference, duplicates allowed) that filters point
// lists by applying each shape's filter in turn. Every member holds the zone's lock for its whole run,
// including the calls into its shapes.
#pragma once

#include "module/method_guard.h"
#include "platform/dispatch_impl.h"
#include "platform/error_info.h"
#include "platform/object.h"

#include <beamweaver/exclusion.h>
#include <beamweaver/pattern.h>

#include <vector>

namespace Norvane::Lumis::Scanning {

class CExclusionZone : public CComObjectRootBase,
                       public IDispatchImpl<IExclusionZone>,
                       public IPatternPointFilter,
                       public ISupportErrorInfoImplEx<IExclusionZone> {
  public:
    using Interfaces = InterfaceMap<IExclusionZone, IPatternPointFilter, ISupportErrorInfo>;

    // IExclusionZone
    HRESULT AddShape(IShape* shape) override;
    HRESULT RemoveShape(IShape* shape) override;
    HRESULT ContainsShape(IShape* shape, VARIANT_BOOL* contained) override;
    HRESULT AddShapeFromPatternShape(IExcludablePatternShape* patternShape) override;
    HRESULT Clear() override;
    HRESULT Clone(IExclusionZone** clone) override;
    HRESULT CopyTo(IExclusionZone* target) override;

    // IPatternPointFilter
    HRESULT FilterList(IPatternPointList* list) override;
    HRESULT FilterListWithOffset(IPatternPointList* list, std::uint16_t offsetX,
                                 std::uint16_t offsetY) override;

  private:
    // Appends a clone of every shape held now to target (which may be this zone).
    void CopyShapesTo(IExclusionZone* target);
    // Calls filter on every shape that is a point filter, in insertion order; a failure stops the loop.
    template <class Filter> void ForEachFilter(Filter&& filter);

    std::vector<CComPtr<IShape>> shapes_;
    ObjectMutex mutex_;
};

} // namespace Norvane::Lumis::Scanning

#include "core/pattern_impl.h"

#include <cmath>
#include <limits>

namespace Norvane::Lumis::Scanning {

void ThrowIfInvalid(IPatternValidationResult* result) {
    const ValidationOutcome outcome = ReadValidationResult(result);
    if (!outcome.valid)
        throw HResultException(E_INVALIDARG, u"", outcome.description, u"", 0);
}

void FilterScanDefinition(IScanDefinition* scanDefinition, IPatternPointFilter* filter) {
    CComPtr<ISubPatternCollection> collection;
    CheckResult(scanDefinition->get_SubPatternCollection(&collection));
    std::int32_t count = 0;
    CheckResult(collection->get_Count(&count));
    for (std::int32_t i = 0; i < count; ++i) {
        CComPtr<ISubPattern> subPattern;
        CheckResult(collection->Item(i, &subPattern));
        CComPtr<IPatternPointList> list;
        std::uint16_t offsetX = 0;
        std::uint16_t offsetY = 0;
        CheckResult(subPattern->get_PointList(&list));
        CheckResult(subPattern->get_OffsetX(&offsetX));
        CheckResult(subPattern->get_OffsetY(&offsetY));
        CheckResult(filter->FilterListWithOffset(list, offsetX, offsetY));
    }
}

std::uint32_t PointsPerInterval(double interval, double meanDwell) {
    const double points = interval / meanDwell;
    if (!(points >= 1.0))
        return 0;
    if (points >= static_cast<double>(std::numeric_limits<std::uint32_t>::max()))
        return std::numeric_limits<std::uint32_t>::max();
    return static_cast<std::uint32_t>(points);
}

} // namespace Norvane::Lumis::Scanning

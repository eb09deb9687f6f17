#include "core/scan_alignments_impl.h"

#include "module/geometry_io.h"

#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

template <RangeEnds Ends> bool AcceptsRange(const RangeInt& range) {
    if (range.minimum < 0)
        return false;
    if constexpr (Ends == RangeEnds::Distinct)
        return range.minimum < range.maximum;
    else
        return range.minimum <= range.maximum;
}

} // namespace

template <class I, class Fields, RangeEnds Ends>
HRESULT CScanAlignmentsImpl<I, Fields, Ends>::get_Range(IRangeInt** value) {
    return Guarded(I::iid, value, [&] {
        *value = nullptr;
        *value = CreateRange(fields_.range.Load()).Detach();
    });
}

template <class I, class Fields, RangeEnds Ends>
HRESULT CScanAlignmentsImpl<I, Fields, Ends>::put_Range(IRangeInt* value) {
    return Guarded(I::iid, [&] {
        const RangeInt range = ReadRange(value);
        if (!AcceptsRange<Ends>(range))
            throw std::invalid_argument("Range values not correct");
        fields_.range.Store(range);
    });
}

template <class I, class Fields, RangeEnds Ends>
HRESULT CScanAlignmentsImpl<I, Fields, Ends>::get_SlewRate(double* value) {
    return fields_.slewRate.Get(I::iid, value);
}

template <class I, class Fields, RangeEnds Ends>
HRESULT CScanAlignmentsImpl<I, Fields, Ends>::put_SlewRate(double value) {
    return fields_.slewRate.Put(I::iid, value, IsPositive);
}

template class CScanAlignmentsImpl<IPatternAlignments, PatternAlignmentFields, RangeEnds::Distinct>;
template class CScanAlignmentsImpl<IRasterAlignments, RasterAlignmentFields, RangeEnds::MayBeEqual>;

} // namespace Norvane::Lumis::Scanning

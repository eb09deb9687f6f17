// The properties every alignment object shares (Range and SlewRate), for the pattern alignments and the
// raster alignments. The two differ only in whether a range may have equal ends and in the raster
// timing values the raster class adds. Value object: no lock (see ValueField), no ISupportErrorInfo.
#pragma once

#include "core/alignment_fields.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/rendering.h>

namespace Norvane::Lumis::Scanning {

// Whether Range put accepts minimum == maximum. Both kinds require minimum >= 0 and minimum <= maximum.
enum class RangeEnds { Distinct, MayBeEqual };

// I: the alignment interface (IPatternAlignments or IRasterAlignments); Fields: its stored values.
template <class I, class Fields, RangeEnds Ends>
class CScanAlignmentsImpl : public CComObjectRootBase, public IDispatchImpl<I> {
  public:
    using Interfaces = InterfaceMap<I>;
    using Record = typename Fields::Record;

    explicit CScanAlignmentsImpl(const Record& value = Record{}) : fields_(value) {}

    // A new range object with the stored ends.
    HRESULT get_Range(IRangeInt** value) override;
    // Null fails as reading a null range does; a range the check refuses fails with
    // "Range values not correct". Either way the stored range is kept.
    HRESULT put_Range(IRangeInt* value) override;
    HRESULT get_SlewRate(double* value) override;
    HRESULT put_SlewRate(double value) override;

  protected:
    Fields fields_;
};

extern template class CScanAlignmentsImpl<IPatternAlignments, PatternAlignmentFields, RangeEnds::Distinct>;
extern template class CScanAlignmentsImpl<IRasterAlignments, RasterAlignmentFields, RangeEnds::MayBeEqual>;

} // namespace Norvane::Lumis::Scanning

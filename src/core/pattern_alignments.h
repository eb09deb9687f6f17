// One axis of a pattern's rendering properties as a value object: the DAC span of the full field of
// view (minimum >= 0, minimum < maximum) and the slew rate (> 0).
#pragma once

#include "core/scan_alignments_impl.h"

namespace Norvane::Lumis::Scanning {

// Created by clients through its class identifier and by the library when it hands an alignment out;
// both start from the defaults of PatternAlignment or hold a copy of the record they were made with.
class CPatternAlignments
    : public CScanAlignmentsImpl<IPatternAlignments, PatternAlignmentFields, RangeEnds::Distinct> {
  public:
    using CScanAlignmentsImpl::CScanAlignmentsImpl;
};

// The creatable class is the same class: the two behave identically in every respect.
using CCoPatternAlignments = CPatternAlignments;

} // namespace Norvane::Lumis::Scanning

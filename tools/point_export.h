// The rendered points as text: a CSV table for inspection and a stream file that stream-file readers
// load back.
#pragma once

#include "tools/rendered_scan.h"

#include <cstdint>
#include <iosfwd>

namespace Norvane::Lumis::Scanning::Tool {

// Header "sub,repeat,x,y,dwell,flags", then one row per point record, sub pattern by sub pattern in
// index order: the sub pattern's index and repeat count, x and y including its offsets, dwell in ticks
// and the flags as a decimal number. Repeats are not expanded.
void WritePointsCsv(const RenderedScan& scan, std::ostream& out);

// The dwell time resolution in whole nanoseconds; a resolution that is not a whole number of
// nanoseconds (or not positive) throws ToolError, since a stream file counts dwell in whole nanoseconds.
std::uint32_t WholeNanoseconds(double seconds);

// Stream file in DAC units: header "s16,<N>ns,dac" (N = the dwell time resolution in nanoseconds, so a
// dwell count is the point's tick count), repeat line 1, the number of point lines, then
// "dwell x y beam_on" per point: every sub pattern in order, played its repeat count times at its
// offsets; beam_on is 0 for blanked points and 1 otherwise. A position beyond the 16-bit DAC range after
// adding the offsets, or a point with dwell 0, which the format cannot hold, throws ToolError.
void WriteStreamFile(const RenderedScan& scan, std::ostream& out);

} // namespace Norvane::Lumis::Scanning::Tool

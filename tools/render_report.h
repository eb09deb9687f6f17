// What rendering one pattern gives: validity, timing values, the bounding box and the rendered points.
#pragma once

#include "tools/rendered_scan.h"

#include <beamweaver/pattern.h>

#include <optional>
#include <string>

namespace Norvane::Lumis::Scanning::Tool {

struct RenderReport {
    std::string className;
    bool valid;
    std::string description; // the validation description as the pattern gives it
    double dwellTimeResolution;
    std::optional<double> loopTime;             // absent for an invalid pattern, which has none
    std::optional<DacRectangle> dacBoundingBox; // absent where the pattern reports E_NOTIMPL
    std::optional<RenderedScan> scan;           // absent for an invalid pattern, which does not render
    std::optional<double> renderSeconds;        // wall time of the Render call
};

// Validates the pattern and reads what can be computed; a valid pattern is also asked for its loop time
// and rendered. A call that fails where it should not throws ToolError naming the call, with the
// library's text and HRESULT.
RenderReport BuildRenderReport(IPattern& pattern, const std::string& className);

} // namespace Norvane::Lumis::Scanning::Tool

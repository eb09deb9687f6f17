// A picture of the field of view showing the exposure dose of a rendering.
#pragma once

#include "tools/rendered_scan.h"

#include <cstdint>
#include <vector>

namespace Norvane::Lumis::Scanning::Tool {

struct PreviewSize {
    int width;
    int height;

    friend bool operator==(const PreviewSize&, const PreviewSize&) = default;
};

// 8-bit RGB, rows top to bottom, three bytes per pixel.
struct RgbImage {
    int width;
    int height;
    std::vector<std::uint8_t> pixels;
};

// The picture of a DAC field: the longer side gets maxSide pixels, or one per DAC position when the
// field is narrower than that; the shorter side follows the field's aspect (at least one pixel). An
// empty field (right < left or bottom < top) throws ToolError.
PreviewSize PreviewSizeFor(const DacRectangle& field, int maxSide);

// Dose per pixel, row-major: the sum of dwell (seconds) × repeat count of every unblanked point, at its
// sub pattern's offsets, that falls in the pixel. Points outside the field are left out.
std::vector<double> AccumulateDose(const RenderedScan& scan, PreviewSize size);

// Colours the dose on the viridis map with a logarithmic scale from the smallest to the largest nonzero
// dose (a single dose level takes the top colour); black where nothing is exposed.
RgbImage ColourDose(const std::vector<double>& dose, PreviewSize size);

// The whole preview of a rendering.
RgbImage RenderDosePreview(const RenderedScan& scan, int maxSide);

} // namespace Norvane::Lumis::Scanning::Tool

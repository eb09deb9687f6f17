// PNG encoding of RGB pictures.
#pragma once

#include "tools/dose_preview.h"

#include <string>

namespace Norvane::Lumis::Scanning::Tool {

// The PNG file bytes of the image. A failure of the encoder throws ToolError.
std::string EncodePng(const RgbImage& image);

} // namespace Norvane::Lumis::Scanning::Tool

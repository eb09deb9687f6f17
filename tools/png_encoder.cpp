#include "tools/png_encoder.h"

#include "tools/tool_error.h"

#include <stb/stb_image_write.h>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

void AppendBytes(void* context, void* data, int size) {
    static_cast<std::string*>(context)->append(static_cast<const char*>(data),
                                               static_cast<std::size_t>(size));
}

} // namespace

std::string EncodePng(const RgbImage& image) {
    constexpr int kChannels = 3;
    std::string bytes;
    if (stbi_write_png_to_func(&AppendBytes, &bytes, image.width, image.height, kChannels,
                               image.pixels.data(), image.width * kChannels) == 0)
        throw ToolError("--preview: the PNG encoder failed");
    return bytes;
}

} // namespace Norvane::Lumis::Scanning::Tool

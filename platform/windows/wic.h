// Pictures decoded by the system's own decoders.
#pragma once

#include <optional>
#include <string_view>

#include "platform/windows/pixels.h"

namespace platform {

// The first frame, over white where it is transparent. Nothing when the decoder refuses it, or when it has more pixels
// than MostPixels.
std::optional<Pixels> DecodeWithWic(std::string_view content);

}  // namespace platform

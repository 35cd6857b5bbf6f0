// GIF pictures. The system's own decoder would take a tenth of the start-up, and shows what a truncated file still
// holds.
#pragma once

#include <optional>
#include <string_view>

#include "platform/windows/pixels.h"

namespace platform {

// The first image of a GIF file, over white where it is transparent. Nothing when any of it is missing or contradicts
// itself, or when it has more pixels than MostPixels.
std::optional<Pixels> DecodeGif(std::string_view content);

}  // namespace platform

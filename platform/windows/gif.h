// GIF pictures. The system's own decoder would add a tenth to the time of the start-up, and need not refuse a truncated
// file.
#pragma once

#include <optional>
#include <string_view>

#include "platform/windows/pixels.h"

namespace platform {

// The first image of a GIF file, over white where it is transparent. Nothing when any of it is missing or contradicts
// itself, or when it has more pixels than MostPixels.
std::optional<Pixels> DecodeGif(std::string_view content);

}  // namespace platform

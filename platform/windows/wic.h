// Pictures decoded by the system's own decoders, which are loaded when the first one is.
#pragma once

#include <windows.h>

#include <optional>
#include <string_view>

#include "platform/picture_file.h"
#include "platform/windows/pixels.h"

namespace platform {

// The first frame, over white where it is transparent, and scaled down to `most` where it is larger. Nothing when the
// decoder refuses it.
std::optional<Pixels> Decode(std::string_view content, PictureFormat format, SIZE most);

}  // namespace platform

// Pictures decoded and encoded by the system's own codecs, which are loaded when the first one is.
#pragma once

#include <windows.h>

#include <optional>
#include <string>
#include <string_view>

#include "platform/picture_file.h"
#include "platform/picture_maker.h"
#include "platform/windows/pixels.h"

namespace platform {

// The first frame, over white where it is transparent, and scaled down to `most` where it is larger. Nothing when the
// decoder refuses it.
std::optional<Pixels> Decode(std::string_view content, PictureFormat format, SIZE most);

// The first frame of any picture that the system knows, over white, fitted into this size. Nothing when it refuses it,
// or when it says that it is larger than picture_file.h lets it be.
std::optional<Pixels> DecodeFitted(std::string_view content, PixelSize most);

// A JPEG file; nothing when the system cannot make it.
std::optional<std::string> EncodeJpeg(const Pixels& pixels);

}  // namespace platform

// What stands behind a picture, and drawing it.
#pragma once

#include <windows.h>

#include <optional>
#include <string>

#include "platform/picture_file.h"
#include "platform/pictures.h"
#include "platform/windows/pixels.h"

namespace platform {

// What a decoder made of a picture for the place where it was last drawn.
struct DecodedPicture {
  SIZE Place = {};  // pixels
  std::optional<Pixels> Image;
};

struct PictureData {
  std::string Content;
  PictureFile File;
  mutable DecodedPicture Decoded;
};

// The picture for a place of this size in pixels, not necessarily in that size, until it is asked for another size.
// Null when the decoder refuses it.
const Pixels* PixelsFor(const Picture& picture, SIZE place);

// Stretches the picture over the area; false when there is none that could be drawn.
bool DrawPicture(HDC context, const RECT& area, const Picture& picture);

}  // namespace platform

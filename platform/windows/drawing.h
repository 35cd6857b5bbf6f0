// Drawing of pictures.
#pragma once

#include <windows.h>

#include "platform/pictures.h"
#include "platform/windows/pixels.h"

namespace platform {

struct PictureData {
  Pixels Image;
};

// Stretches the picture over the area.
void DrawPicture(HDC context, const RECT& area, const Picture& picture);

}  // namespace platform

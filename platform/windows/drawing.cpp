#include "platform/windows/drawing.h"

namespace platform {

void DrawPicture(HDC context, const RECT& area, const Picture& picture) {
  if (!picture) return;
  const Pixels& image = picture.Data()->Image;
  BITMAPINFO format{};
  format.bmiHeader.biSize = sizeof format.bmiHeader;
  format.bmiHeader.biWidth = image.Width;
  format.bmiHeader.biHeight = -image.Height;  // rows from the top
  format.bmiHeader.biPlanes = 1;
  format.bmiHeader.biBitCount = 32;
  ::SetStretchBltMode(context, HALFTONE);
  ::SetBrushOrgEx(context, 0, 0, nullptr);
  ::StretchDIBits(context, area.left, area.top, area.right - area.left, area.bottom - area.top, 0, 0, image.Width,
                  image.Height, image.Colours.data(), &format, DIB_RGB_COLORS, SRCCOPY);
}

}  // namespace platform

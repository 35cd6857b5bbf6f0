#include "platform/windows/drawing.h"

#include <cstdlib>

namespace platform {
namespace {

// A row or a column more or less is left out or doubled; to mix all of them takes four times as long and blurs them.
bool Fits(const Pixels& image, const RECT& area) {
  return std::abs(area.right - area.left - image.Width) <= 1 && std::abs(area.bottom - area.top - image.Height) <= 1;
}

}  // namespace

void DrawPicture(HDC context, const RECT& area, const Picture& picture) {
  if (!picture) return;
  const Pixels& image = picture.Data()->Image;
  BITMAPINFO format{};
  format.bmiHeader.biSize = sizeof format.bmiHeader;
  format.bmiHeader.biWidth = image.Width;
  format.bmiHeader.biHeight = -image.Height;  // rows from the top
  format.bmiHeader.biPlanes = 1;
  format.bmiHeader.biBitCount = 32;
  ::SetStretchBltMode(context, Fits(image, area) ? COLORONCOLOR : HALFTONE);
  ::SetBrushOrgEx(context, 0, 0, nullptr);
  ::StretchDIBits(context, area.left, area.top, area.right - area.left, area.bottom - area.top, 0, 0, image.Width,
                  image.Height, image.Colours.data(), &format, DIB_RGB_COLORS, SRCCOPY);
}

}  // namespace platform

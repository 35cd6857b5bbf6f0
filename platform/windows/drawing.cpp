#include "platform/windows/drawing.h"

#include <cstdlib>

namespace platform {
namespace {

// Where the picture and its place differ by one row or column, that one is left out or doubled; to mix all of them
// takes four times as long and blurs them.
bool Fits(int image, int area) { return std::abs(area - image) <= 1; }

// How many rows or columns are drawn: all but one at the end that is too many.
int Drawn(int image, int area) { return image == area + 1 ? area : image; }

}  // namespace

bool DrawPicture(HDC context, const RECT& area, const Picture& picture) {
  const int width = area.right - area.left, height = area.bottom - area.top;
  const Pixels* const decoded = picture ? PixelsFor(picture, {width, height}) : nullptr;
  if (decoded == nullptr) return false;
  const Pixels& image = *decoded;
  const int columns = Drawn(image.Width, width), rows = Drawn(image.Height, height);
  BITMAPINFO format{};
  format.bmiHeader.biSize = sizeof format.bmiHeader;
  format.bmiHeader.biWidth = image.Width;
  format.bmiHeader.biHeight = -rows;  // rows from the top
  format.bmiHeader.biPlanes = 1;
  format.bmiHeader.biBitCount = 32;
  ::SetStretchBltMode(context, Fits(image.Width, width) && Fits(image.Height, height) ? COLORONCOLOR : HALFTONE);
  ::SetBrushOrgEx(context, 0, 0, nullptr);
  ::StretchDIBits(context, area.left, area.top, width, height, 0, 0, columns, rows, image.Colours.data(), &format,
                  DIB_RGB_COLORS, SRCCOPY);
  return true;
}

}  // namespace platform

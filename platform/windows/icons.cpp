#include "platform/windows/icons.h"

#include <algorithm>
#include <string>

#include "platform/windows/resource.h"

namespace platform {
namespace {

RGBQUAD TimesAlpha(RGBQUAD pixel) {
  const auto times = [&](BYTE colour) { return static_cast<BYTE>(colour * pixel.rgbReserved / 255); };
  return {times(pixel.rgbBlue), times(pixel.rgbGreen), times(pixel.rgbRed), pixel.rgbReserved};
}

// An icon's bitmap: 32 bits a pixel, the bottom row first, and behind them the mask that the alpha channel replaces.
const BITMAPINFOHEADER* IconBitmap(int id, int side) {
  std::string sizes(Resource(id, RT_GROUP_ICON));
  if (sizes.empty()) return nullptr;
  const int next = ::LookupIconIdFromDirectoryEx(reinterpret_cast<BYTE*>(sizes.data()), TRUE, side, side, 0);
  return reinterpret_cast<const BITMAPINFOHEADER*>(Resource(next, RT_ICON).data());
}

}  // namespace

IconHandle LoadIconFor(int id, int side) {
  return IconHandle(static_cast<HICON>(
      ::LoadImageA(::GetModuleHandleA(nullptr), MAKEINTRESOURCEA(id), IMAGE_ICON, side, side, LR_DEFAULTCOLOR)));
}

ButtonImage LoadButtonImage(int id, int side) {
  const BITMAPINFOHEADER* const icon = IconBitmap(id, side);
  if (icon == nullptr) return {};
  BITMAPINFO format{};
  format.bmiHeader = *icon;
  format.bmiHeader.biHeight = icon->biWidth;
  void* pixels = nullptr;
  ButtonImage image{GdiHandle<HBITMAP>(::CreateDIBSection(nullptr, &format, DIB_RGB_COLORS, &pixels, nullptr, 0)),
                    icon->biWidth};
  if (image.Bitmap == nullptr) return {};
  const auto* const first = reinterpret_cast<const RGBQUAD*>(icon + 1);
  std::transform(first, first + image.Side * image.Side, static_cast<RGBQUAD*>(pixels), TimesAlpha);
  return image;
}

}  // namespace platform

#include "platform/picture_maker.h"

#include <windows.h>

#include <cstring>
#include <exception>
#include <memory>
#include <type_traits>

#include "platform/windows/wic.h"

namespace platform {
namespace {

struct ObjectDeleter {
  void operator()(HGDIOBJ object) const { ::DeleteObject(object); }
};
struct ContextDeleter {
  void operator()(HDC context) const { ::DeleteDC(context); }
};
template <typename Handle, typename Deleter>
using Owned = std::unique_ptr<std::remove_pointer_t<Handle>, Deleter>;

// A bitmap in memory that can be drawn on; its pixels go from the top.
struct Canvas {
  explicit Canvas(PixelSize size) : Context(::CreateCompatibleDC(nullptr)) {
    BITMAPINFO format{};
    format.bmiHeader.biSize = sizeof format.bmiHeader;
    format.bmiHeader.biWidth = size.Width;
    format.bmiHeader.biHeight = -size.Height;
    format.bmiHeader.biPlanes = 1;
    format.bmiHeader.biBitCount = 32;
    Bitmap.reset(::CreateDIBSection(Context.get(), &format, DIB_RGB_COLORS, &Bits, nullptr, 0));
    if (Bitmap) Before = ::SelectObject(Context.get(), Bitmap.get());
  }
  ~Canvas() {
    if (Before != nullptr) ::SelectObject(Context.get(), Before);
  }
  Canvas(const Canvas&) = delete;
  Canvas& operator=(const Canvas&) = delete;

  void* Bits = nullptr;
  Owned<HBITMAP, ObjectDeleter> Bitmap;
  Owned<HDC, ContextDeleter> Context;
  HGDIOBJ Before = nullptr;
};

constexpr UINT Centred = DT_CENTER | DT_WORDBREAK | DT_NOPREFIX;

Owned<HFONT, ObjectDeleter> FontOf(int height) {
  return Owned<HFONT, ObjectDeleter>(::CreateFontA(-height, 0, 0, 0, FW_BOLD, FALSE, FALSE, FALSE, DEFAULT_CHARSET,
                                                   OUT_DEFAULT_PRECIS, CLIP_DEFAULT_PRECIS, ANTIALIASED_QUALITY,
                                                   DEFAULT_PITCH | FF_SWISS, "Arial"));
}

// Draws the text when it fits into the area, a word that is too long for a line included.
bool DrawFitting(HDC context, const std::string& text, const RECT& area, int height) {
  const auto font = FontOf(height);
  const HGDIOBJ before = ::SelectObject(context, font.get());
  RECT needed = {0, 0, area.right - area.left, 0};
  const int length = static_cast<int>(text.size());
  ::DrawTextA(context, text.data(), length, &needed, Centred | DT_CALCRECT);
  const bool fits = needed.right <= area.right - area.left && needed.bottom <= area.bottom - area.top;
  if (fits) {
    RECT place = area;
    place.top += (area.bottom - area.top - needed.bottom) / 2;
    ::DrawTextA(context, text.data(), length, &place, Centred);
  }
  ::SelectObject(context, before);
  return fits;
}

void DrawLargest(HDC context, const std::string& text, PixelSize size) {
  constexpr COLORREF background = RGB(28, 40, 84), letters = RGB(255, 255, 255);
  constexpr int smallest = 8;
  const int margin = size.Width / 20;
  const RECT all = {0, 0, size.Width, size.Height};
  const RECT area = {margin, margin, size.Width - margin, size.Height - margin};
  const Owned<HBRUSH, ObjectDeleter> brush(::CreateSolidBrush(background));
  ::FillRect(context, &all, brush.get());
  ::SetTextColor(context, letters);
  ::SetBkMode(context, TRANSPARENT);
  for (int height = size.Height / 6; height >= smallest && !DrawFitting(context, text, area, height); --height) {
  }
}

std::optional<Pixels> Drawn(const std::string& text, PixelSize size) {
  const Canvas canvas(size);
  if (!canvas.Bitmap) return std::nullopt;
  DrawLargest(canvas.Context.get(), text, size);
  ::GdiFlush();
  Pixels pixels{size.Width, size.Height, {}};
  pixels.Colours.resize(static_cast<std::size_t>(size.Width) * static_cast<std::size_t>(size.Height));
  std::memcpy(pixels.Colours.data(), canvas.Bits, pixels.Colours.size() * sizeof pixels.Colours[0]);
  return pixels;
}

std::optional<std::string> Encoded(const std::optional<Pixels>& pixels) {
  return pixels ? EncodeJpeg(*pixels) : std::nullopt;
}

}  // namespace

std::optional<std::string> MakeJpeg(std::string_view content, PixelSize most) {
  try {
    return Encoded(DecodeFitted(content, most));
  } catch (const std::exception&) {  // not enough memory
    return std::nullopt;
  }
}

std::optional<std::string> DrawJpeg(const std::string& text, PixelSize size) {
  try {
    return Encoded(Drawn(text, size));
  } catch (const std::exception&) {
    return std::nullopt;
  }
}

}  // namespace platform

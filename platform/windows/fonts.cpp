#include "platform/windows/fonts.h"

#include <memory>
#include <type_traits>
#include <vector>

#include "platform/windows/screen.h"

namespace platform {
namespace {

struct FontDeleter {
  void operator()(HFONT font) const { ::DeleteObject(font); }
};
using FontHandle = std::unique_ptr<std::remove_pointer_t<HFONT>, FontDeleter>;

struct KnownFont {
  Font Wanted;
  int Dpi;
  FontHandle Handle;
};

// "MS Sans Serif" is a bitmap font of a few sizes, drawn for the usual resolution. Elsewhere its scalable twin serves.
const char* Face(int dpi) { return dpi == UsualDpi ? "MS Sans Serif" : "Microsoft Sans Serif"; }

HFONT CreateFontFor(const Font& font, int dpi) {
  const int height = ::MulDiv(font.TenthsOfPoint, dpi, 720);
  return ::CreateFontA(-height, 0, 0, 0, font.Bold ? FW_BOLD : FW_NORMAL, FALSE, FALSE, FALSE, DEFAULT_CHARSET,
                       OUT_DEFAULT_PRECIS, CLIP_DEFAULT_PRECIS, DEFAULT_QUALITY, DEFAULT_PITCH | FF_DONTCARE,
                       Face(dpi));
}

}  // namespace

HFONT FontFor(const Font& font, int dpi) {
  static std::vector<KnownFont> known;
  for (const KnownFont& one : known) {
    if (one.Dpi == dpi && one.Wanted.TenthsOfPoint == font.TenthsOfPoint && one.Wanted.Bold == font.Bold) {
      return one.Handle.get();
    }
  }
  known.push_back({font, dpi, {}});
  known.back().Handle.reset(CreateFontFor(font, dpi));
  return known.back().Handle.get();
}

}  // namespace platform

#include "platform/windows/screen.h"

#include <utility>
#include <vector>

#include "platform/screen.h"
#include "platform/windows/gdi_handle.h"
#include "platform/windows/system_library.h"

namespace platform {
namespace {

struct KnownFont {
  Font Wanted;
  int Dpi;
  GdiHandle<HFONT> Handle;
};

// "MS Sans Serif" is a bitmap font of a few sizes, drawn for the usual resolution. Elsewhere its scalable twin serves.
const char* Face(int dpi) { return dpi == UsualDpi ? "MS Sans Serif" : "Microsoft Sans Serif"; }

HFONT CreateFontFor(const Font& font, int dpi) {
  const int height = ::MulDiv(font.TenthsOfPoint, dpi, 720);
  return ::CreateFontA(-height, 0, 0, 0, font.Bold ? FW_BOLD : FW_NORMAL, FALSE, FALSE, FALSE, DEFAULT_CHARSET,
                       OUT_DEFAULT_PRECIS, CLIP_DEFAULT_PRECIS, DEFAULT_QUALITY, DEFAULT_PITCH | FF_DONTCARE,
                       Face(dpi));
}

BOOL CALLBACK AddMonitor(HMONITOR, HDC, LPRECT place, LPARAM monitors) {
  const int dpi = DpiOfScreen();
  reinterpret_cast<std::vector<Bounds>*>(monitors)->push_back({ToTwips(place->left, dpi), ToTwips(place->top, dpi),
                                                               ToTwips(place->right - place->left, dpi),
                                                               ToTwips(place->bottom - place->top, dpi)});
  return TRUE;
}

}  // namespace

int ScreenWidth() { return ToTwips(::GetSystemMetrics(SM_CXSCREEN), DpiOfScreen()); }

int ScreenHeight() { return ToTwips(::GetSystemMetrics(SM_CYSCREEN), DpiOfScreen()); }

std::vector<Bounds> Monitors() {
  std::vector<Bounds> monitors;
  ::EnumDisplayMonitors(nullptr, nullptr, AddMonitor, reinterpret_cast<LPARAM>(&monitors));
  return monitors;
}

// It stays the same for as long as the program runs.
int DpiOfScreen() {
  static const int dpi = [] {
    if (const auto ofSystem = SystemFunction<UINT WINAPI()>("user32.dll", "GetDpiForSystem")) {
      return static_cast<int>(ofSystem());
    }
    const HDC screen = ::GetDC(nullptr);
    const int ofScreen = ::GetDeviceCaps(screen, LOGPIXELSX);
    ::ReleaseDC(nullptr, screen);
    return ofScreen;
  }();
  return dpi > 0 ? dpi : UsualDpi;
}

// The functions that know of a resolution for each monitor came with Windows 10; before it, all windows have the
// screen's.
int DpiOfWindow(HWND window) {
  static const auto getDpiForWindow = SystemFunction<UINT WINAPI(HWND)>("user32.dll", "GetDpiForWindow");
  const int dpi = getDpiForWindow != nullptr ? static_cast<int>(getDpiForWindow(window)) : 0;
  return dpi > 0 ? dpi : DpiOfScreen();
}

DWORD NativeStyle(const WindowStyle& style) {
  return WS_OVERLAPPED | WS_CAPTION | WS_SYSMENU | WS_CLIPCHILDREN | (style.MinimizeBox ? WS_MINIMIZEBOX : 0UL);
}

SIZE WindowSize(const WindowStyle& style, int dpi) {
  static const auto adjustForDpi =
      SystemFunction<BOOL WINAPI(LPRECT, DWORD, BOOL, DWORD, UINT)>("user32.dll", "AdjustWindowRectExForDpi");
  RECT area = {0, 0, ToPixels(style.ClientWidth, dpi), ToPixels(style.ClientHeight, dpi)};
  if (adjustForDpi != nullptr) {
    adjustForDpi(&area, NativeStyle(style), FALSE, 0, static_cast<UINT>(dpi));
  } else {
    ::AdjustWindowRectEx(&area, NativeStyle(style), FALSE, 0);
  }
  return {area.right - area.left, area.bottom - area.top};
}

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

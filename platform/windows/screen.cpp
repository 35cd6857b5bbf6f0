#include "platform/windows/screen.h"

#include <vector>

#include "platform/screen.h"
#include "platform/windows/system_library.h"

namespace platform {
namespace {

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

}  // namespace platform

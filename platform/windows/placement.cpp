#include "platform/windows/placement.h"

#include "platform/windows/system_library.h"

namespace platform {

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

POINT CentredCorner(const WindowState& window, const SIZE& size) {
  const HWND first = AllWindows().front() == &window ? nullptr : AllWindows().front()->Handle;
  MONITORINFO monitor{};
  monitor.cbSize = sizeof monitor;
  if (first == nullptr || !::GetMonitorInfoA(::MonitorFromWindow(first, MONITOR_DEFAULTTOPRIMARY), &monitor)) {
    monitor.rcMonitor = {0, 0, ::GetSystemMetrics(SM_CXSCREEN), ::GetSystemMetrics(SM_CYSCREEN)};
  }
  const RECT& place = monitor.rcMonitor;
  return {(place.left + place.right - size.cx) / 2, (place.top + place.bottom - size.cy) / 2};
}

void PlaceWindow(WindowState& window, int left, int top) {
  const SIZE size = WindowSize(window.Style, window.Dpi);
  const RECT wanted = {left, top, left + size.cx, top + size.cy};
  RECT place = {};
  ::GetWindowRect(window.Handle, &place);
  if (!::EqualRect(&place, &wanted)) {
    ::SetWindowPos(window.Handle, nullptr, left, top, size.cx, size.cy, SWP_NOZORDER | SWP_NOACTIVATE);
  }
  // Not every version of Windows draws the frame in the window's own resolution.
  RECT client = {};
  ::GetClientRect(window.Handle, &client);
  const int wider = ToPixels(window.Style.ClientWidth, window.Dpi) - client.right;
  const int higher = ToPixels(window.Style.ClientHeight, window.Dpi) - client.bottom;
  if (wider == 0 && higher == 0) return;
  ::SetWindowPos(window.Handle, nullptr, 0, 0, size.cx + wider, size.cy + higher,
                 SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
}

void MoveWindowTo(const WindowState& window, int left, int top) {
  const RECT place = PlaceOf(window);
  if (place.left == left && place.top == top) return;
  ::SetWindowPos(window.Handle, nullptr, left, top, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
}

RECT PlaceOf(const WindowState& window) {
  if (window.Handle == nullptr) return window.LastPlace;
  RECT place = {};
  if (!::IsIconic(window.Handle)) {
    ::GetWindowRect(window.Handle, &place);
    return place;
  }
  WINDOWPLACEMENT placement{};
  placement.length = sizeof placement;
  ::GetWindowPlacement(window.Handle, &placement);
  place = placement.rcNormalPosition;  // relative to the work area
  MONITORINFO monitor{};
  monitor.cbSize = sizeof monitor;
  ::GetMonitorInfoA(::MonitorFromRect(&place, MONITOR_DEFAULTTONEAREST), &monitor);
  ::OffsetRect(&place, monitor.rcWork.left - monitor.rcMonitor.left, monitor.rcWork.top - monitor.rcMonitor.top);
  return place;
}

}  // namespace platform

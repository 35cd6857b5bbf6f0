#include <algorithm>
#include <utility>

#include "platform/windows/pictures.h"
#include "platform/windows/state.h"
#include "resources/ids.h"

namespace platform {
namespace {

constexpr int LargeIconSide = 32, SmallIconSide = 16;

ControlState* FindControl(const WindowState& window, HWND handle) {
  const auto found = std::find_if(window.Controls.begin(), window.Controls.end(),
                                  [&](const ControlState* control) { return control->Handle == handle; });
  return handle != nullptr && found != window.Controls.end() ? *found : nullptr;
}

// Also draws what lies behind a control, on the control's own context, which is left as it was.
void EraseBackground(const WindowState& window, HDC context) {
  RECT area = {};
  ::GetClientRect(window.Handle, &area);
  const int before = ::SaveDC(context);
  if (window.Background) {
    const PictureFile& picture = window.Background.Data()->File;
    const RECT place = {0, 0, Scaled(picture.Width, window.Dpi), Scaled(picture.Height, window.Dpi)};
    if (DrawPicture(context, place, window.Background)) ::ExcludeClipRect(context, 0, 0, place.right, place.bottom);
  }
  ::FillRect(context, &area, ::GetSysColorBrush(COLOR_BTNFACE));
  ::RestoreDC(context, before);
}

// The keyboard goes back to the control that had it, and at first to the one that is first in order. False when the
// window has to keep it.
bool PassFocusOn(const WindowState& window) {
  HWND target = window.Focus;
  if (target == nullptr) target = ::GetNextDlgTabItem(window.Handle, nullptr, FALSE);
  if (target == nullptr || !::IsWindowEnabled(target) || !::IsWindowVisible(target)) return false;
  ::SetFocus(target);
  return true;
}

// Whether the window has become the active one, and stands on the screen.
bool Activated(WPARAM wParam) { return LOWORD(wParam) != WA_INACTIVE && HIWORD(wParam) == 0; }

IconHandle ProgramIcon(int side, int dpi) { return LoadIconFor(ICONE_PROGRAMA, Scaled(side, dpi)); }

void ChangeIcon(IconHandle& icon, const WindowState& window, WPARAM size, int side) {
  IconHandle next = ProgramIcon(side, window.Dpi);
  ::SendMessageA(window.Handle, WM_SETICON, size, reinterpret_cast<LPARAM>(next.get()));
  icon.swap(next);
}

void ChangeDpi(WindowState& window, int dpi, const RECT& suggested) {
  if (dpi == 0) return;
  window.Dpi = dpi;
  PlaceWindow(window, suggested.left, suggested.top);
  LayOutWindow(window);
}

void Tick(const WindowState& window, UINT_PTR id) {
  for (const TimerState* timer : window.Timers) {
    if (reinterpret_cast<UINT_PTR>(timer) != id) continue;
    if (timer->Enabled) Raise(timer->Object.OnTick);
    return;
  }
}

void Command(const WindowState& window, WPARAM wParam, HWND sender) {
  const ControlState* control = FindControl(window, sender);
  if (control != nullptr && control->OnNotification) {
    control->OnNotification(HIWORD(wParam));
  } else if (LOWORD(wParam) == IDCANCEL && window.Style.CloseOnEscape) {
    ::SendMessageA(window.Handle, WM_CLOSE, 0, 0);
  }
}

// The brush for the ground of a text, or null for the usual one.
HBRUSH TextGround(const WindowState& window, HDC context, HWND sender) {
  const ControlState* control = FindControl(window, sender);
  if (control == nullptr || !control->WhiteGround) return nullptr;
  ::SetBkColor(context, RGB(255, 255, 255));
  ::SetTextColor(context, RGB(0, 0, 0));
  return static_cast<HBRUSH>(::GetStockObject(WHITE_BRUSH));
}

// The mouse's own messages go past a control that is disabled, and a frame lies over the controls in it.
bool MouseAsksForToolTip(const WindowState& window) {
  POINT mouse = {};
  ::GetCursorPos(&mouse);
  return std::any_of(window.Controls.begin(), window.Controls.end(), [&](const ControlState* control) {
    RECT place = {};
    return !control->ToolTip.empty() && ::GetWindowRect(control->Handle, &place) && ::PtInRect(&place, mouse);
  });
}

// Any program can send any message: these, which come with a pointer, without one.
bool LacksItsPointer(UINT message, LPARAM lParam) {
  const bool hasOne = message == WM_DRAWITEM || message == WM_DPICHANGED || message == WM_NCCREATE;
  return hasOne && lParam == 0;
}

// Whether the message is answered here, and the answer.
std::pair<bool, LRESULT> Answer(WindowState& window, UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    case WM_COMMAND:
      Command(window, wParam, reinterpret_cast<HWND>(lParam));
      return {true, 0};
    case WM_DRAWITEM: {
      const auto& item = *reinterpret_cast<const DRAWITEMSTRUCT*>(lParam);
      const ControlState* control = FindControl(window, item.hwndItem);
      if (control == nullptr || !control->Draw) return {false, 0};
      control->Draw(item);
      return {true, TRUE};
    }
    case WM_CTLCOLORSTATIC: {
      const HBRUSH ground = TextGround(window, reinterpret_cast<HDC>(wParam), reinterpret_cast<HWND>(lParam));
      return {ground != nullptr, reinterpret_cast<LRESULT>(ground)};
    }
    case WM_ERASEBKGND:
      EraseBackground(window, reinterpret_cast<HDC>(wParam));
      return {true, TRUE};
    case WM_SETCURSOR:  // also for its controls
      if (window.ToolTips == nullptr && MouseAsksForToolTip(window)) StartToolTips(window);
      return {false, 0};
    case WM_TIMER:
      Tick(window, wParam);
      return {true, 0};
    case WM_ACTIVATE:  // the window itself would be given the keyboard first
      return {Activated(wParam) && PassFocusOn(window), 0};
    case WM_SETFOCUS:
      PassFocusOn(window);
      return {true, 0};
    case WM_DPICHANGED:
      ChangeDpi(window, HIWORD(wParam), *reinterpret_cast<const RECT*>(lParam));
      return {true, 0};
    case WM_CLOSE:  // the close box of a window that takes no input does nothing
      if (::IsWindowEnabled(window.Handle)) window.Object.Close();
      return {true, 0};
    case WM_DESTROY:  // by its owner's end, perhaps
      PrepareToClose(window, true);
      return {true, 0};
    default:
      return {false, 0};
  }
}

LRESULT CALLBACK WindowProcedure(HWND handle, UINT message, WPARAM wParam, LPARAM lParam) {
  if (LacksItsPointer(message, lParam)) return 0;
  auto* window = reinterpret_cast<WindowState*>(::GetWindowLongPtrA(handle, GWLP_USERDATA));
  if (window == nullptr && message == WM_NCCREATE) {  // once: what is told about a window that stands is not believed
    window = static_cast<WindowState*>(reinterpret_cast<const CREATESTRUCTA*>(lParam)->lpCreateParams);
    window->Handle = handle;
    ::SetWindowLongPtrA(handle, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(window));
  }
  if (window != nullptr) {
    if (message == WM_NCDESTROY) {
      window->Handle = nullptr;
      ::SetWindowLongPtrA(handle, GWLP_USERDATA, 0);
    } else if (const auto [answered, result] = Answer(*window, message, wParam, lParam); answered) {
      return result;
    }
  }
  return ::DefWindowProcA(handle, message, wParam, lParam);
}

}  // namespace

void RegisterWindowClass() {
  static const ATOM registered = [] {
    WNDCLASSEXA description{};
    description.cbSize = sizeof description;
    description.lpfnWndProc = WindowProcedure;
    description.hInstance = ::GetModuleHandleA(nullptr);
    description.hCursor = ::LoadCursorA(nullptr, MAKEINTRESOURCEA(32512));    // the arrow
    description.hIcon = ProgramIcon(LargeIconSide, DpiOfScreen()).release();  // for as long as the program runs
    description.hIconSm = ProgramIcon(SmallIconSide, DpiOfScreen()).release();
    description.lpszClassName = WindowClass;
    return ::RegisterClassExA(&description);
  }();
  static_cast<void>(registered);
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

void LayOutWindow(WindowState& window) {
  ChangeIcon(window.LargeIcon, window, ICON_BIG, LargeIconSide);
  ChangeIcon(window.SmallIcon, window, ICON_SMALL, SmallIconSide);
  for (ControlState* control : window.Controls) LayOutControl(*control);
  ::InvalidateRect(window.Handle, nullptr, TRUE);
}

void PrepareToClose(WindowState& window, bool unload) {
  if (window.Closing) return;
  window.Closing = true;
  if (unload) Raise(window.Object.OnUnload);
  for (const HWND other : window.Disabled) ::EnableWindow(other, TRUE);
  ::GetWindowRect(window.Handle, &window.LastPlace);
  window.LastEnabled = ::IsWindowEnabled(window.Handle) != FALSE;
  for (ControlState* control : window.Controls) RememberControl(*control);
}

}  // namespace platform

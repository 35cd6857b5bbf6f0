#include <utility>

#include "platform/windows/control.h"
#include "platform/windows/events.h"
#include "platform/windows/pictures.h"
#include "platform/windows/placement.h"
#include "platform/windows/timer.h"
#include "platform/windows/tooltips.h"
#include "platform/windows/window.h"

namespace platform {
namespace {

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

void ChangeDpi(WindowState& window, int dpi, const RECT& suggested) {
  if (dpi == 0) return;
  window.Dpi = dpi;
  PlaceWindow(window, suggested.left, suggested.top);
  LayOutWindow(window);
}

void Command(const WindowState& window, WPARAM wParam, HWND sender) {
  if (ControlState* const control = FindControl(window, sender)) {
    control->OnNotification(HIWORD(wParam));
  } else if (LOWORD(wParam) == IDCANCEL && window.Style.CloseOnEscape) {
    ::SendMessageA(window.Handle, WM_CLOSE, 0, 0);
  }
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
      ControlState* const control = FindControl(window, item.hwndItem);
      if (control != nullptr) control->Draw(item);
      return {control != nullptr, TRUE};
    }
    case WM_CTLCOLORSTATIC: {
      ControlState* const control = FindControl(window, reinterpret_cast<HWND>(lParam));
      const HBRUSH ground = control != nullptr ? control->TextGround(reinterpret_cast<HDC>(wParam)) : nullptr;
      return {ground != nullptr, reinterpret_cast<LRESULT>(ground)};
    }
    case WM_ERASEBKGND:
      EraseBackground(window, reinterpret_cast<HDC>(wParam));
      return {true, TRUE};
    case WM_SETCURSOR:  // also for its controls
      OfferToolTips(window);
      return {false, 0};
    case WM_TIMER:
      Tick(window, wParam);
      return {true, 0};
    case WM_ACTIVATE:  // the window itself would be given the keyboard first
      return {Activated(wParam) && PassFocusOn(window), 0};
    case WM_SETFOCUS:
      PassFocusOn(window);
      return {true, 0};
    case WM_HELP:  // from the control that has the keyboard, which passes it on
      Raise(window.Object.OnHelp);
      return {true, TRUE};
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
    description.hCursor = ::LoadCursorA(nullptr, MAKEINTRESOURCEA(32512));        // the arrow
    description.hIcon = LoadProgramIcon(LargeIconSide, DpiOfScreen()).release();  // for as long as the program runs
    description.hIconSm = LoadProgramIcon(SmallIconSide, DpiOfScreen()).release();
    description.lpszClassName = WindowClass;
    return ::RegisterClassExA(&description);
  }();
  static_cast<void>(registered);
}

}  // namespace platform

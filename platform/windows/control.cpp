#include "platform/windows/control.h"

#include <algorithm>

#include "platform/windows/accessibility.h"
#include "platform/windows/fonts.h"
#include "platform/windows/tooltips.h"
#include "platform/windows/wide.h"

namespace platform {
namespace {

constexpr int FirstId = 100;  // above the numbers that the keyboard's rules give a meaning

// Enter is asked for before it is sent to the control.
bool IsEnter(LPARAM lParam) {
  const auto* event = reinterpret_cast<const MSG*>(lParam);
  return event != nullptr && event->wParam == VK_RETURN;
}

// The keyboard's rules give the button that Tab has reached a thicker frame, and take it back only when Tab leaves it.
void EndDefault(HWND control) {
  if ((::SendMessageA(control, WM_GETDLGCODE, 0, 0) & DLGC_DEFPUSHBUTTON) == 0) return;
  ::SendMessageA(control, BM_SETSTYLE, BS_PUSHBUTTON, TRUE);
}

LRESULT CALLBACK ControlProcedure(HWND handle, UINT message, WPARAM wParam, LPARAM lParam) {
  auto& control = *reinterpret_cast<ControlState*>(::GetWindowLongPtrA(handle, GWLP_USERDATA));
  const WNDPROC native = control.Native;
  switch (message) {
    case WM_GETDLGCODE:
      if (!control.EnterIsKey || !IsEnter(lParam)) break;
      return ::CallWindowProcW(native, handle, message, wParam, lParam) | DLGC_WANTMESSAGE;
    case WM_KEYDOWN:
      if (control.OnKey(static_cast<int>(wParam), (HIWORD(lParam) & KF_REPEAT) != 0)) return 0;
      if (control.Handle == nullptr) return 0;  // the key has closed the window
      break;
    case WM_CHAR:
      if (control.EnterIsKey && wParam == VK_RETURN) return 0;
      break;
    case WM_SETFOCUS:
      if (control.Owner != nullptr) control.Owner->Focus = handle;
      break;
    case WM_KILLFOCUS:
      EndDefault(handle);
      break;
    case WM_ERASEBKGND:
      if (control.DrawsItself) return TRUE;
      break;
    case WM_GETOBJECT:  // a screen reader
      TellName(control);
      break;
    case WM_NCDESTROY:
      ForgetName(control);
      control.Handle = nullptr;
      ::SetWindowLongPtrW(handle, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(native));
      break;
    default:
      break;
  }
  return ::CallWindowProcW(native, handle, message, wParam, lParam);
}

// With the wide form the control takes and gives texts as it keeps them; who sends it ANSI has them converted.
// Not with SetWindowSubclass, which looks up a property of the window at each message: under Wine that takes twenty
// times as long as to add an entry to a list.
void TakeMessages(ControlState& control) {
  if (control.Handle == nullptr) return;
  ::SetWindowLongPtrA(control.Handle, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(&control));
  control.Native = reinterpret_cast<WNDPROC>(
      ::SetWindowLongPtrW(control.Handle, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(ControlProcedure)));
}

// Arrow keys move between neighbours of the same kind, Tab between all.
DWORD GroupStyle(const WindowState& window, const char* nativeClass) {
  char last[32] = "";
  if (!window.Controls.empty()) ::GetClassNameA(window.Controls.back()->Handle, last, sizeof last);
  return ::lstrcmpiA(last, nativeClass) == 0 ? 0UL : DWORD{WS_GROUP};
}

// The window keeps the keyboard itself when a control loses it by being switched off, and gives it back.
void KeepFocus(const ControlState& control) {
  const HWND window = control.Owner->Handle;
  if (control.Owner->Focus != control.Handle || ::GetActiveWindow() != window) return;
  const HWND focus = ::GetFocus();
  const bool usable = IsEnabled(control) && IsVisible(control);
  if (usable && focus == window) ::SetFocus(control.Handle);
  if (!usable && (focus == nullptr || focus == control.Handle)) ::SetFocus(window);
}

// What goes with whether the user can use the control.
void Follow(const ControlState& control) {
  KeepFocus(control);
  UpdateToolTip(control);
}

Bounds PixelsOf(const ControlState& control) {
  const int dpi = control.Owner->Dpi;
  const Bounds& place = control.Place;
  return {ToPixels(place.Left, dpi), ToPixels(place.Top, dpi), ToPixels(place.Width, dpi), ToPixels(place.Height, dpi)};
}

void SetFont(const ControlState& control, bool redraw) {
  const HFONT font = FontFor(control.Face, control.Owner->Dpi);
  ::SendMessageA(control.Handle, WM_SETFONT, reinterpret_cast<WPARAM>(font), redraw);
}

}  // namespace

void CreateControl(ControlState& control, const Container& container, const Bounds& bounds, const NativeControl& native,
                   const std::string& text, const Font& font) {
  WindowState& window = container.Parent.State();
  control.Owner = &window;
  control.Place = bounds;
  control.Place.Left += container.Left;
  control.Place.Top += container.Top;
  control.Face = font;
  control.Caption = text;
  const DWORD group = GroupStyle(window, native.Class);
  const auto id = static_cast<std::uintptr_t>(FirstId) + window.Controls.size();
  window.Controls.push_back(&control);
  if (window.Handle == nullptr) return;
  const Bounds place = PixelsOf(control);
  control.Handle =
      ::CreateWindowExA(native.ExtendedStyle, native.Class, text.c_str(), WS_CHILD | WS_VISIBLE | group | native.Style,
                        place.Left, place.Top, place.Width, place.Height, window.Handle, reinterpret_cast<HMENU>(id),
                        ::GetModuleHandleA(nullptr), nullptr);
  TakeMessages(control);
  SetFont(control, false);
}

ControlState* FindControl(const WindowState& window, HWND handle) {
  const auto found = std::find_if(window.Controls.begin(), window.Controls.end(),
                                  [&](const ControlState* control) { return control->Handle == handle; });
  return handle != nullptr && found != window.Controls.end() ? *found : nullptr;
}

void LayOutControl(ControlState& control) {
  if (control.Handle == nullptr) return;
  const Bounds place = PixelsOf(control);
  ::SetWindowPos(control.Handle, nullptr, place.Left, place.Top, place.Width, place.Height,
                 SWP_NOZORDER | SWP_NOACTIVATE);
  SetFont(control, true);
  control.LayOut();
  UpdateToolTip(control);
}

bool IsEnabled(const ControlState& control) {
  return control.Handle != nullptr ? ::IsWindowEnabled(control.Handle) != FALSE : control.LastEnabled;
}

// IsWindowVisible would ask its window, too.
bool IsVisible(const ControlState& control) {
  if (control.Handle == nullptr) return control.LastVisible;
  return (::GetWindowLongPtrA(control.Handle, GWL_STYLE) & WS_VISIBLE) != 0;
}

void RememberControl(ControlState& control) {
  control.LastEnabled = IsEnabled(control);
  control.LastVisible = IsVisible(control);
  control.Remember();
}

Control::Control() = default;  // each kind makes its own state

Control::~Control() {
  if (state_ == nullptr || state_->Owner == nullptr) return;
  if (state_->Owner->Focus == state_->Handle) state_->Owner->Focus = nullptr;
  std::erase(state_->Owner->Controls, state_.get());
  if (state_->Handle != nullptr) ::DestroyWindow(state_->Handle);
}

bool Control::Enabled() const { return IsEnabled(*state_); }

void Control::Enable(bool enabled) {
  if (state_->Handle == nullptr || enabled == Enabled()) return;
  ::EnableWindow(state_->Handle, enabled);
  Follow(*state_);
}

bool Control::Visible() const { return IsVisible(*state_); }

void Control::Show(bool visible) {
  if (state_->Handle == nullptr || visible == Visible()) return;
  ::ShowWindow(state_->Handle, visible ? SW_SHOWNA : SW_HIDE);
  Follow(*state_);
}

void Control::SetFocus() {
  if (state_->Handle == nullptr || !Enabled() || !Visible()) return;
  state_->Owner->Focus = state_->Handle;
  if (::GetActiveWindow() == state_->Owner->Handle) ::SetFocus(state_->Handle);  // else once the window is active
}

std::string Control::Caption() const { return state_->Caption; }

void Control::SetCaption(const std::string& caption) {
  if (state_->Handle == nullptr || caption == state_->Caption) return;
  state_->Caption = caption;
  if (!state_->NamedByToolTip) ::SetWindowTextA(state_->Handle, caption.c_str());
  state_->LayOut();
}

std::string Control::ToolTip() const { return state_->ToolTip; }

void Control::SetToolTip(const std::string& text) {
  if (state_->Handle == nullptr || text == state_->ToolTip) return;
  state_->ToolTip = text;
  if (state_->NamedByToolTip) ::SetWindowTextA(state_->Handle, text.c_str());
  UpdateToolTip(*state_);
}

std::string Control::AccessibleName() const { return state_->AccessibleName; }

// Also as the control's text, by which some readers call it, where that is not on the screen.
void Control::SetAccessibleName(const std::string& name) {
  if (state_->Handle == nullptr || name == state_->AccessibleName) return;
  state_->AccessibleName = name;
  state_->NameIsTold = false;
  if (!state_->ShowsText) ::SetWindowTextW(state_->Handle, ToShown(name).c_str());
  ::NotifyWinEvent(EVENT_OBJECT_NAMECHANGE, state_->Handle, OBJID_CLIENT, CHILDID_SELF);
}

std::int32_t Control::Handle() const {
  return static_cast<std::int32_t>(reinterpret_cast<std::intptr_t>(state_->Handle));
}

}  // namespace platform

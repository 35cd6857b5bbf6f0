#include "platform/windows/window.h"

#include <algorithm>

#include "platform/windows/control.h"
#include "platform/windows/events.h"
#include "platform/windows/placement.h"
#include "platform/windows/timer.h"

namespace platform {
namespace {

void Create(WindowState& window) {
  window.Dpi = DpiOfScreen();
  const SIZE size = WindowSize(window.Style, window.Dpi);
  const POINT corner = CentredCorner(window, size);
  ::CreateWindowExA(0, WindowClass, window.Style.Caption.c_str(), NativeStyle(window.Style), corner.x, corner.y,
                    size.cx, size.cy, nullptr, nullptr, ::GetModuleHandleA(nullptr), &window);
}

// The monitor may have another resolution than the screen as a whole.
void FitToMonitor(WindowState& window) {
  window.Dpi = DpiOfWindow(window.Handle);
  const POINT corner = CentredCorner(window, WindowSize(window.Style, window.Dpi));
  PlaceWindow(window, corner.x, corner.y);
}

// Nothing when it is that already: it would be drawn anew.
void SetNativeCaption(const WindowState& window) {
  const std::string& caption = window.Style.Caption;
  std::string shown(caption.size() + 2, '\0');
  shown.resize(static_cast<std::size_t>(::GetWindowTextA(window.Handle, shown.data(), static_cast<int>(shown.size()))));
  if (shown != caption) ::SetWindowTextA(window.Handle, caption.c_str());
}

void ChangeIcon(IconHandle& icon, const WindowState& window, WPARAM size, int side) {
  IconHandle next = LoadProgramIcon(side, window.Dpi);
  ::SendMessageA(window.Handle, WM_SETICON, size, reinterpret_cast<LPARAM>(next.get()));
  icon.swap(next);
}

}  // namespace

std::vector<WindowState*>& AllWindows() {
  static std::vector<WindowState*> windows;
  return windows;
}

WindowState* FindWindowState(HWND handle) {
  const auto found = std::find_if(AllWindows().begin(), AllWindows().end(),
                                  [&](const WindowState* window) { return window->Handle == handle; });
  return handle != nullptr && found != AllWindows().end() ? *found : nullptr;
}

HWND OwnerForModal() {
  const HWND active = ::GetActiveWindow();
  if (FindWindowState(active) != nullptr && ::IsWindowVisible(active)) return active;
  HWND owner = nullptr;
  for (const WindowState* window : AllWindows()) {
    if (::IsWindowVisible(window->Handle) && ::IsWindowEnabled(window->Handle)) owner = window->Handle;
  }
  return owner;
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

Window::Window(const WindowStyle& style) : state_(std::make_unique<WindowState>(*this, style)) {
  RegisterWindowClass();
  AllWindows().push_back(state_.get());
  if (style.Background != 0) state_->Background = LoadPictureResource(style.Background);
  Create(*state_);
  if (state_->Handle == nullptr) return;
  const int before = state_->Dpi;
  FitToMonitor(*state_);
  if (state_->Dpi != before) LayOutWindow(*state_);
}

Window::~Window() {
  if (state_->Handle != nullptr) {
    PrepareToClose(*state_, false);
    ::DestroyWindow(state_->Handle);
  }
  for (ControlState* control : state_->Controls) control->Owner = nullptr;
  for (TimerState* timer : state_->Timers) timer->Owner = nullptr;
  std::erase(AllWindows(), state_.get());
}

void Window::Show() {
  SetNativeCaption(*state_);
  ::ShowWindow(state_->Handle, SW_SHOWNORMAL);
  ::UpdateWindow(state_->Handle);
}

void Window::ShowModal() {
  if (state_->Handle == nullptr) return;
  const HWND owner = OwnerForModal();
  ::SetWindowLongPtrA(state_->Handle, GWLP_HWNDPARENT, reinterpret_cast<LONG_PTR>(owner));
  for (const WindowState* other : AllWindows()) {
    if (other == state_.get() || !::IsWindowVisible(other->Handle) || !::IsWindowEnabled(other->Handle)) continue;
    ::EnableWindow(other->Handle, FALSE);
    state_->Disabled.push_back(other->Handle);
  }
  const OwnEventLoop loop;
  Show();
  MSG event;
  while (!IsClosed() && ::GetMessageA(&event, nullptr, 0, 0) > 0) HandleEvent(event);
  Close();
  if (::IsWindowEnabled(owner)) ::SetActiveWindow(owner);
}

void Window::Close() {
  if (state_->Handle == nullptr || state_->Closing) return;
  PrepareToClose(*state_, true);
  ::DestroyWindow(state_->Handle);
}

bool Window::IsClosed() const { return state_->Handle == nullptr; }

std::string Window::Caption() const { return state_->Style.Caption; }

void Window::SetCaption(const std::string& caption) {
  if (state_->Handle == nullptr) return;
  state_->Style.Caption = caption;
  if (::IsWindowVisible(state_->Handle)) SetNativeCaption(*state_);
}

int Window::Left() const { return ToTwips(PlaceOf(*state_).left, DpiOfScreen()); }

int Window::Top() const { return ToTwips(PlaceOf(*state_).top, DpiOfScreen()); }

int Window::Width() const {
  const RECT place = PlaceOf(*state_);
  return ToTwips(place.right - place.left, DpiOfScreen());
}

int Window::Height() const {
  const RECT place = PlaceOf(*state_);
  return ToTwips(place.bottom - place.top, DpiOfScreen());
}

void Window::SetLeft(int left) { MoveWindowTo(*state_, ToPixels(left, DpiOfScreen()), PlaceOf(*state_).top); }

void Window::SetTop(int top) { MoveWindowTo(*state_, PlaceOf(*state_).left, ToPixels(top, DpiOfScreen())); }

bool Window::Enabled() const {
  return state_->Handle != nullptr ? ::IsWindowEnabled(state_->Handle) != FALSE : state_->LastEnabled;
}

void Window::Enable(bool enabled) { ::EnableWindow(state_->Handle, enabled); }

std::int32_t Window::Handle() const {
  return static_cast<std::int32_t>(reinterpret_cast<std::intptr_t>(state_->Handle));
}

}  // namespace platform

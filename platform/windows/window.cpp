#include "platform/controls.h"
#include "platform/windows/state.h"

namespace platform {
namespace {

// In the middle of the primary monitor.
POINT CornerFor(const SIZE& size) {
  return {(::GetSystemMetrics(SM_CXSCREEN) - size.cx) / 2, (::GetSystemMetrics(SM_CYSCREEN) - size.cy) / 2};
}

void Create(WindowState& window) {
  window.Dpi = DpiOfScreen();
  const SIZE size = WindowSize(window.Style, window.Dpi);
  const POINT corner = CornerFor(size);
  ::CreateWindowExA(0, WindowClass, window.Style.Caption.c_str(), NativeStyle(window.Style), corner.x, corner.y,
                    size.cx, size.cy, nullptr, nullptr, ::GetModuleHandleA(nullptr), &window);
}

// The monitor may have another resolution than the screen as a whole.
void FitToMonitor(WindowState& window) {
  window.Dpi = DpiOfWindow(window.Handle);
  const POINT corner = CornerFor(WindowSize(window.Style, window.Dpi));
  PlaceWindow(window, corner.x, corner.y);
}

// Where the window is in screen pixels; of a minimized window, where it will be again.
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

// Nothing when it is that already: it would be drawn anew.
void SetNativeCaption(const WindowState& window) {
  const std::string& caption = window.Style.Caption;
  std::string shown(caption.size() + 2, '\0');
  shown.resize(static_cast<std::size_t>(::GetWindowTextA(window.Handle, shown.data(), static_cast<int>(shown.size()))));
  if (shown != caption) ::SetWindowTextA(window.Handle, caption.c_str());
}

void MoveTo(const WindowState& window, int left, int top) {
  const RECT place = PlaceOf(window);
  if (place.left == left && place.top == top) return;
  ::SetWindowPos(window.Handle, nullptr, left, top, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
}

}  // namespace

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

void Window::SetLeft(int left) { MoveTo(*state_, ToPixels(left, DpiOfScreen()), PlaceOf(*state_).top); }

void Window::SetTop(int top) { MoveTo(*state_, PlaceOf(*state_).left, ToPixels(top, DpiOfScreen())); }

bool Window::Enabled() const {
  return state_->Handle != nullptr ? ::IsWindowEnabled(state_->Handle) != FALSE : state_->LastEnabled;
}

void Window::Enable(bool enabled) { ::EnableWindow(state_->Handle, enabled); }

std::int32_t Window::Handle() const {
  return static_cast<std::int32_t>(reinterpret_cast<std::intptr_t>(state_->Handle));
}

}  // namespace platform

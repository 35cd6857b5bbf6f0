#include <algorithm>
#include <utility>

#include "platform/screen.h"
#include "platform/simulated/machine.h"

namespace platform {
namespace {

using simulated::TheMachine;
using simulated::WindowFacts;

constexpr int FrameWidth = 90, FrameHeight = 375;  // twips that the frame adds to the client area

// The primary one while there is no main window, or where it stands on none.
Bounds MonitorOfMainWindow() {
  const auto& main = TheMachine().MainWindow;
  if (!main || main->Closed) return TheMachine().PrimaryMonitor;
  for (const Bounds& each : TheMachine().OtherMonitors) {
    const int right = main->Left + main->Width / 2 - each.Left;
    const int below = main->Top + main->Height / 2 - each.Top;
    if (right >= 0 && right < each.Width && below >= 0 && below < each.Height) return each;
  }
  return TheMachine().PrimaryMonitor;
}

}  // namespace

Window::Window(const WindowStyle& style) : state_(std::make_unique<WindowState>()) {
  auto facts = std::make_shared<WindowFacts>();
  facts->Self = this;
  facts->Closed = TheMachine().RefusesWindows;
  facts->Style = style;
  facts->Caption = style.Caption;
  facts->Width = style.ClientWidth + FrameWidth;
  facts->Height = style.ClientHeight + FrameHeight;
  const Bounds monitor = MonitorOfMainWindow();
  facts->Left = monitor.Left + (monitor.Width - facts->Width) / 2;
  facts->Top = monitor.Top + (monitor.Height - facts->Height) / 2;
  facts->Handle = static_cast<std::int32_t>(++TheMachine().LastHandle);
  if (!TheMachine().MainWindow) TheMachine().MainWindow = facts;
  TheMachine().Windows.push_back(facts);
  state_->Facts = std::move(facts);
}

Window::~Window() {
  WindowFacts& facts = *state_->Facts;
  facts.Closed = true;
  facts.Self = nullptr;
  std::erase(TheMachine().Windows, state_->Facts);
}

void Window::Show() {
  if (!IsClosed()) state_->Facts->Shown = true;
}

void Window::ShowModal() {
  if (IsClosed()) return;
  Show();
  if (!TheMachine().ModalScripts.empty()) {
    const simulated::ModalTurn turn(state_->Facts.get());
    const auto script = std::move(TheMachine().ModalScripts.front());
    TheMachine().ModalScripts.pop_front();
    script(*this);
  }
  Close();
}

void Window::Close() {
  WindowFacts& facts = *state_->Facts;
  if (facts.Closed || std::exchange(facts.Closing, true)) return;
  simulated::RunHandler(OnUnload);
  facts.Closed = true;
  facts.Shown = false;
}

bool Window::IsClosed() const { return state_->Facts->Closed; }

std::string Window::Caption() const { return state_->Facts->Caption; }

void Window::SetCaption(const std::string& caption) {
  if (!IsClosed()) state_->Facts->Caption = caption;
}

int Window::Left() const { return state_->Facts->Left; }
int Window::Top() const { return state_->Facts->Top; }
int Window::Width() const { return state_->Facts->Width; }
int Window::Height() const { return state_->Facts->Height; }

void Window::SetLeft(int left) {
  if (!IsClosed()) state_->Facts->Left = left;
}

void Window::SetTop(int top) {
  if (!IsClosed()) state_->Facts->Top = top;
}

bool Window::Enabled() const { return state_->Facts->Enabled; }

void Window::Enable(bool enabled) {
  if (!IsClosed()) state_->Facts->Enabled = enabled;
}

std::int32_t Window::Handle() const { return state_->Facts->Handle; }

Timer::Timer(Window& window, std::uint32_t intervalMilliseconds)
    : state_(std::make_unique<TimerState>(TimerState{window.State().Facts, intervalMilliseconds})) {}

Timer::~Timer() = default;

bool Timer::Enabled() const { return state_->Enabled; }

void Timer::Enable(bool enabled) {
  if (!state_->Window->Closed) state_->Enabled = enabled;
}

int ScreenWidth() { return TheMachine().PrimaryMonitor.Width; }
int ScreenHeight() { return TheMachine().PrimaryMonitor.Height; }

std::vector<Bounds> Monitors() {
  std::vector<Bounds> monitors = TheMachine().OtherMonitors;
  monitors.push_back(TheMachine().PrimaryMonitor);
  return monitors;
}

}  // namespace platform

namespace platform::simulated {

void RefuseWindows(bool refused) { TheMachine().RefusesWindows = refused; }

void AddMonitor(const Bounds& place) { TheMachine().OtherMonitors.push_back(place); }

bool TakesInput(const WindowFacts& window) {
  const std::vector<const WindowFacts*>& modal = TheMachine().Modal;
  return window.Shown && window.Enabled && !window.Closed && (modal.empty() || modal.back() == &window);
}

void CountDroppedException() { ++TheMachine().DroppedExceptions; }

ModalTurn::ModalTurn(const WindowFacts* window) { TheMachine().Modal.push_back(window); }

ModalTurn::~ModalTurn() {
  if (!TheMachine().Modal.empty()) TheMachine().Modal.pop_back();
}

}  // namespace platform::simulated

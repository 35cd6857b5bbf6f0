#include "platform/windows/timer.h"

#include "platform/windows/events.h"

namespace platform {
namespace {

UINT_PTR IdOf(const TimerState& timer) { return reinterpret_cast<UINT_PTR>(&timer); }

HWND WindowOf(const TimerState& timer) { return timer.Owner != nullptr ? timer.Owner->Handle : nullptr; }

}  // namespace

void Tick(const WindowState& window, UINT_PTR id) {
  for (const TimerState* timer : window.Timers) {
    if (IdOf(*timer) != id) continue;
    if (timer->Enabled) Raise(timer->Object.OnTick);
    return;
  }
}

Timer::Timer(Window& window, std::uint32_t intervalMilliseconds)
    : state_(std::make_unique<TimerState>(TimerState{*this, &window.State(), intervalMilliseconds})) {
  state_->Owner->Timers.push_back(state_.get());
}

Timer::~Timer() {
  Enable(false);
  if (state_->Owner != nullptr) std::erase(state_->Owner->Timers, state_.get());
}

bool Timer::Enabled() const { return state_->Enabled; }

void Timer::Enable(bool enabled) {
  const HWND window = WindowOf(*state_);
  if (window == nullptr || enabled == state_->Enabled) return;
  state_->Enabled = enabled;
  if (enabled) {
    ::SetTimer(window, IdOf(*state_), state_->Interval, nullptr);
  } else {
    ::KillTimer(window, IdOf(*state_));
  }
}

}  // namespace platform

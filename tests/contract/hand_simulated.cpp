#include "platform/simulated/simulated.h"
#include "tests/contract/hand.h"

namespace contract {

namespace simulated = platform::simulated;

Desk::Desk() { simulated::Reset(); }
Desk::~Desk() { simulated::Reset(); }

void Click(platform::Button& button) { simulated::Click(button); }
void Click(platform::ImageButton& button) { simulated::Click(button); }
void Click(platform::CheckBox& box) { simulated::Click(box); }
void Choose(platform::ListBox& list, int index) { simulated::Choose(list, index); }
void Choose(platform::ComboBox& box, int index) { simulated::Choose(box, index); }

void DoubleClick(platform::ListBox& list, int index) {
  simulated::Choose(list, index);
  simulated::DoubleClick(list);
}

void PressKey(platform::ListBox& list, int keyCode) { simulated::PressKey(list, keyCode); }
void UseCloseBox(platform::Window& window) { simulated::CloseWindow(window); }
void QueueEvent(std::function<void()> event) { simulated::QueueEvent(std::move(event)); }

void QueueModal(std::function<void()> script) {
  simulated::QueueModal([script = std::move(script)](platform::Window&) { script(); });
}

void QueueAnswer(platform::Answer answer) { simulated::QueueAnswer(answer); }

bool WaitUntil(const std::function<bool()>& condition, std::initializer_list<platform::Timer*> timers) {
  constexpr int most = 100;  // ticks
  for (int i = 0; i < most && !condition(); ++i) {
    for (platform::Timer* timer : timers) simulated::Tick(*timer);
  }
  return condition();
}

}  // namespace contract

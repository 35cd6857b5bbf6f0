#include "platform/simulated/simulated.h"
#include "tests/contract/hand.h"

namespace contract {

void Click(Button& button) { simulated::Click(button); }
void Click(ImageButton& button) { simulated::Click(button); }
void Click(CheckBox& box) { simulated::Click(box); }
void Choose(ListBox& list, int index) { simulated::Choose(list, index); }
void Choose(ComboBox& box, int index) { simulated::Choose(box, index); }
void DoubleClick(ListBox& list, int index) { Choose(list, index), simulated::DoubleClick(list); }
void PressKey(ListBox& list, int keyCode) { simulated::PressKey(list, keyCode); }
void UseCloseBox(Window& window) { simulated::CloseWindow(window); }
void QueueEvent(std::function<void()> event) { simulated::QueueEvent(std::move(event)); }
void QueueModal(std::function<void()> script) {
  simulated::QueueModal([script = std::move(script)](Window&) { script(); });
}

bool WaitUntil(const std::function<bool()>& condition, std::initializer_list<Timer*> timers) {
  for (int ticks = 0; ticks < 100 && !condition(); ++ticks) {
    for (Timer* timer : timers) simulated::Tick(*timer);
  }
  return condition();
}

}  // namespace contract

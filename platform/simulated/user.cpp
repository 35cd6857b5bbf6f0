// The user's hands, and what the user sees.
#include <algorithm>
#include <utility>

#include "platform/keys.h"
#include "platform/simulated/machine.h"

namespace platform::simulated {
namespace {

// A control that is clicked takes the keyboard focus. False when the user cannot reach it.
bool Touch(const Control& control) {
  if (!TakesInput(control.State())) return false;
  control.State().Window->Focus = control.State().Self;
  return true;
}

template <typename List>
void ChooseEntry(List& list, int index) {
  if (index < 0 || index >= std::ssize(list.State().Entries) || !Touch(list)) return;
  list.State().Selected = index;
  RunHandler(list.OnClick);
}

// The modal window, else the last one that is shown, or is to be. Null when there is none.
const WindowFacts* ActiveWindow() {
  const Machine& machine = TheMachine();
  for (auto modal = machine.Modal.rbegin(); modal != machine.Modal.rend(); ++modal) {
    if (*modal) return *modal;
  }
  const WindowFacts* active = nullptr;
  for (const auto& window : machine.Windows) {
    if (!window->Closed && (!active || window->Shown || !active->Shown)) active = window.get();
  }
  return active;
}

// Where the keys that move the selection lead; nothing for other keys.
std::optional<int> Destination(int keyCode, int selected, int count) {
  if (keyCode == KeyEnd) return count - 1;
  if (keyCode == KeyHome) return 0;
  if (keyCode == KeyUp) return std::max(selected - 1, 0);
  if (keyCode == KeyDown) return std::min(selected + 1, count - 1);
  return std::nullopt;
}

}  // namespace

void QueueModal(std::function<void(Window&)> script) { TheMachine().ModalScripts.push_back(std::move(script)); }

void Click(Button& button) {
  if (Touch(button)) RunHandler(button.OnClick);
}

void Click(ImageButton& button) {
  if (Touch(button)) RunHandler(button.OnClick);
}

void Click(CheckBox& box) {
  if (Touch(box)) box.SetValue(1 - box.Value());
}

void Choose(ListBox& list, int index) { ChooseEntry(list, index); }

void Choose(ComboBox& box, int index) { ChooseEntry(box, index); }

void DoubleClick(ListBox& list) {
  if (Touch(list)) RunHandler(list.OnDoubleClick);
}

void PressKey(ListBox& list, int keyCode) { HoldKey(list, keyCode, 0); }

void HoldKey(ListBox& list, int keyCode, int repeats) {
  for (int i = 0; i <= repeats && Touch(list); ++i) {
    if (i == 0) RunHandler(list.OnKeyDown, keyCode);
    const std::optional<int> destination = Destination(keyCode, list.Selected(), list.Count());
    if (destination && *destination != list.Selected()) ChooseEntry(list, *destination);
  }
}

void CloseWindow(Window& window) {
  if (TakesInput(*window.State().Facts)) window.Close();
}

void PressHelp(Window& window) {
  if (TakesInput(*window.State().Facts)) RunHandler(window.OnHelp);
}

void Tick(Timer& timer) {
  if (timer.Enabled() && !timer.State().Window->Closed) RunHandler(timer.OnTick);
}

bool IsShown(const Window& window) { return window.State().Facts->Shown; }

Window* WindowFromHandle(std::int32_t handle) {
  for (const auto& window : TheMachine().Windows) {
    if (window->Handle == handle) return window->Self;
  }
  return nullptr;
}

std::vector<Control*> ControlsOf(const Window& window) { return window.State().Facts->Controls; }

Bounds BoundsOf(const Control& control) { return control.State().Place; }

// A control that is switched off keeps its claim, and has the focus again once it is switched on.
const Control* Focused() {
  const WindowFacts* window = ActiveWindow();
  const Control* focus = window ? window->Focus : nullptr;
  return focus && focus->Enabled() && focus->Visible() ? focus : nullptr;
}

WindowStyle StyleOf(const Window& window) { return window.State().Facts->Style; }

int IconOf(const Control& control) { return control.State().Icon; }

Font FontOf(const Control& control) { return control.State().Letters; }

bool HasWhiteGround(const Control& control) { return control.State().WhiteGround; }

std::vector<std::string> EntriesOf(const ComboBox& box) {
  std::vector<std::string> texts;
  for (const ListEntry& entry : box.State().Entries) texts.push_back(entry.Text);
  return texts;
}

std::uint32_t IntervalOf(const Timer& timer) { return timer.State().Interval; }

int DroppedExceptions() { return TheMachine().DroppedExceptions; }

}  // namespace platform::simulated

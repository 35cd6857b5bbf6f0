#include "platform/simulated/simulated.h"
#include "tests/contract/hand.h"

namespace contract {

Machine::Machine() : here_("C:\\Pasta de teste\\") {
  simulated::Reset();
  simulated::PutDirectory(here_);
}

Machine::~Machine() { simulated::Reset(); }

void SetAttributes(const string& path, std::uint32_t attributes) { simulated::SetAttributes(path, attributes); }
void SetAge(const string& path, unsigned seconds) { simulated::SetAge(path, seconds); }
void SetEnvironment(const string& name, const string& value) { simulated::SetEnvironment(name, value); }
bool IsWine() { return false; }

// Ends when it is waited for the second time: the first wait finds it running.
string StandIn() {
  const string program = "C:\\Substituto.exe";
  simulated::PutFile(program, "program");
  simulated::OnProcess(program, 2,
                       [] { simulated::PutFile(simulated::StartedProcesses().back().Directory + "\\here", ""); });
  return program;
}

void Click(Button& button) { simulated::Click(button); }
void Click(ImageButton& button) { simulated::Click(button); }
void Click(CheckBox& box) { simulated::Click(box); }
void Choose(ListBox& list, int index) { simulated::Choose(list, index); }
void HoldKey(ListBox& list, int keyCode, int repeats) { simulated::HoldKey(list, keyCode, repeats); }
void UseCloseBox(Window& window) { simulated::CloseWindow(window); }
void QueueEvent(std::function<void()> event) { simulated::QueueEvent(std::move(event)); }
void QueueModal(std::function<void()> script) {
  simulated::QueueModal([script = std::move(script)](Window&) { script(); });
}

}  // namespace contract

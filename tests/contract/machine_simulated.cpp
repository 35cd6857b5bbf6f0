#include "platform/simulated/simulated.h"
#include "tests/contract/machine.h"

namespace contract {

Machine::Machine() : here_("C:\\Pasta de teste\\") {
  simulated::Reset();
  simulated::PutDirectory(here_);
}

Machine::~Machine() { simulated::Reset(); }

void SetAttributes(const string& path, std::uint32_t attributes) { simulated::SetAttributes(path, attributes); }
void SetEnvironment(const string& name, const string& value) { simulated::SetEnvironment(name, value); }
bool IsWine() { return false; }

// Ends when it is waited for the second time: the first wait finds it running.
string StandIn() {
  const string program = "C:\\Substituto.exe";
  simulated::PutFile(program, "program");
  simulated::OnProcess(program, 2, [] {
    const auto& [commandLine, directory, flags] = simulated::StartedProcesses().back();
    simulated::PutFile(directory + "\\here.txt", std::to_string(flags) + " " + commandLine);
  });
  return program;
}

void TellStandInToEnd() {}

}  // namespace contract

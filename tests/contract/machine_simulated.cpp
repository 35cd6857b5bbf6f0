#include "platform/simulated/simulated.h"
#include "tests/contract/machine.h"

namespace contract {

namespace simulated = platform::simulated;

FreshDirectory::FreshDirectory() : path_("C:\\Pasta de teste\\") {
  simulated::Reset();
  simulated::PutDirectory(path_);
}

FreshDirectory::~FreshDirectory() { simulated::Reset(); }

FreshKey::FreshKey() : path_("Software\\Contrato") {
  simulated::Reset();
  simulated::PutValue(path_, "", 1, {});  // makes the key; the value without a name is not looked at
}

FreshKey::~FreshKey() { simulated::Reset(); }

void SetAttributes(const std::string& path, std::uint32_t attributes) { simulated::SetAttributes(path, attributes); }

void SetEnvironment(const std::string& name, const std::string& value) { simulated::SetEnvironment(name, value); }

bool ProtectsReadOnlyFiles() { return true; }

bool StartsWithPriority() { return true; }

// Ends when it is waited for the second time: the first wait finds it running.
StandIn::StandIn() : commandLine_("C:\\Substituto.exe") {
  simulated::PutFile(commandLine_, "program");
  simulated::OnProcess(commandLine_, 2, [] {
    const simulated::StartedProcess& process = simulated::StartedProcesses().back();
    const bool slash = process.Directory.ends_with('\\');
    simulated::PutFile(process.Directory + (slash ? "" : "\\") + "here.txt",
                       std::to_string(process.CreationFlags) + " " + process.CommandLine);
  });
}

StandIn::~StandIn() = default;

void StandIn::TellToEnd() {}

}  // namespace contract

#include "platform/processes.h"

#include <optional>
#include <utility>

#include "platform/simulated/machine.h"
#include "platform/text.h"

namespace platform {
namespace {

using simulated::Locate;
using simulated::Place;
using simulated::ProcessBehaviour;
using simulated::RunningProcess;
using simulated::StartedProcess;
using simulated::TheMachine;

// The file that a program's name stands for, ".exe" added where the name has no extension.
std::optional<std::string> ProgramFile(std::string name) {
  const std::size_t part = name.find_last_of("\\/:");
  if (name.find('.', part == std::string::npos ? 0 : part) == std::string::npos) name += ".exe";
  const std::optional<Place> place = Locate(name);
  const bool isFile = place && place->Found && !place->Found->IsDirectory();
  return isFile ? std::optional(place->Path) : std::nullopt;
}

// The program that a command line starts: what stands in quotes, else up to the first blank that ends a file's name.
std::optional<std::string> FindProgram(const std::string& commandLine) {
  if (commandLine.starts_with('"')) {
    return ProgramFile(commandLine.substr(1, commandLine.find('"', 1) - 1));
  }
  for (std::size_t end = 0; end != std::string::npos;) {
    end = commandLine.find_first_of(" \t", end == 0 ? 0 : end + 1);
    if (end == 0) return std::nullopt;
    if (std::optional<std::string> program = ProgramFile(commandLine.substr(0, end))) return program;
  }
  return std::nullopt;
}

bool IsFor(const ProcessBehaviour& behaviour, const std::string& commandLine, const std::string& program) {
  const std::string line = CharUpperBuffA(commandLine.substr(commandLine.starts_with('"') ? 1 : 0));
  return line.starts_with(CharUpperBuffA(behaviour.Program)) || ProgramFile(behaviour.Program) == program;
}

const ProcessBehaviour* FindBehaviour(const std::string& commandLine, const std::string& program) {
  const auto& all = TheMachine().Behaviours;
  for (auto behaviour = all.rbegin(); behaviour != all.rend(); ++behaviour) {
    if (IsFor(*behaviour, commandLine, program)) return &*behaviour;
  }
  return nullptr;
}

bool IsDirectory(const std::string& path) { return path.empty() || simulated::DirectoryStands(path); }

// The process may start others or end the machine's life meanwhile: nothing of its record is held during the call.
void End(std::intptr_t process) {
  RunningProcess& record = TheMachine().Processes.at(process);
  record.Ended = true;
  const std::function<void()> run = std::move(record.Run);
  if (run) run();
}

// The handle of the started process; 0 when it refuses to start.
std::intptr_t Start(StartedProcess start, const std::string& program) {
  const ProcessBehaviour* behaviour = FindBehaviour(start.CommandLine, program);
  if (behaviour && behaviour->Refuses) return 0;
  TheMachine().Started.push_back(std::move(start));
  const std::intptr_t process = ++TheMachine().LastHandle;
  const int waits = behaviour ? behaviour->Waits : 0;
  TheMachine().Processes[process] = {!behaviour, false, waits, behaviour ? behaviour->Run : nullptr};
  if (behaviour && waits == 0) End(process);
  return process;
}

}  // namespace

Process CreateProcessA(const std::string& commandLine, std::uint32_t creationFlags, const std::string& directory) {
  Process process;
  const bool fault = simulated::Fails();
  const bool cut = commandLine.find('\0') != std::string::npos;
  const std::optional<std::string> program = cut ? std::nullopt : FindProgram(commandLine);
  if (fault || !program || !IsDirectory(directory)) return process;
  process.needsElevation_ = TheMachine().ForAdministrators.contains(CharUpperBuffA(*program));
  if (!process.needsElevation_) process.process_ = Start({commandLine, directory, creationFlags, ""}, *program);
  return process;
}

Process ShellExecuteExA(const std::string& verb, const std::string& file, const std::string& parameters,
                        const std::string& directory) {
  Process process;
  const bool fault = simulated::Fails();
  const std::string line = file + " " + parameters;
  const bool cut = (verb + line).find('\0') != std::string::npos;
  const std::optional<std::string> program = cut ? std::nullopt : ProgramFile(file);
  if (fault || !program || !IsDirectory(directory)) return process;
  process.process_ = Start({line, directory, PriorityNormal, verb}, *program);
  return process;
}

Process::Process(Process&& other) noexcept
    : process_(std::exchange(other.process_, 0)), needsElevation_(other.needsElevation_) {}

Process& Process::operator=(Process&& other) noexcept {
  std::swap(process_, other.process_);
  needsElevation_ = other.needsElevation_;
  return *this;
}

Process::~Process() {
  if (process_ != 0) TheMachine().Processes.erase(process_);
}

bool Process::WaitForEnd(std::uint32_t milliseconds) const {
  const auto found = TheMachine().Processes.find(process_);
  if (found == TheMachine().Processes.end() || found->second.Ended) return true;
  TheMachine().Slept += milliseconds;
  if (found->second.RunsForEver || --found->second.WaitsLeft > 0) return false;
  End(process_);
  return true;
}

}  // namespace platform

namespace platform::simulated {

void OnProcess(const std::string& program, int waits, std::function<void()> run) {
  TheMachine().Behaviours.push_back({program, false, waits, std::move(run)});
}

void RefuseToStart(const std::string& program) { TheMachine().Behaviours.push_back({program, true, 0, nullptr}); }

void RequireAdministrator(const std::string& program) {
  TheMachine().ForAdministrators.insert(CharUpperBuffA(program));
}

const std::vector<StartedProcess>& StartedProcesses() { return TheMachine().Started; }

std::size_t HeldProcesses() { return TheMachine().Processes.size(); }

}  // namespace platform::simulated

// Other programs.
#pragma once

#include <cstdint>
#include <string>

namespace platform {

// Creation flags: the priority class of the new process.
inline constexpr std::uint32_t PriorityNormal = 0x20;
inline constexpr std::uint32_t PriorityIdle = 0x40;
inline constexpr std::uint32_t PriorityHigh = 0x80;
inline constexpr std::uint32_t PriorityRealtime = 0x100;

// A started process; its handles are released at the end of its life, the process goes on.
class Process {
 public:
  Process() = default;
  Process(Process&& other) noexcept;
  Process& operator=(Process&& other) noexcept;
  Process(const Process&) = delete;
  Process& operator=(const Process&) = delete;
  ~Process();

  bool Started() const { return process_ != 0; }

  // It was not started because only an administrator may run the program.
  bool NeedsElevation() const { return needsElevation_; }

  // Waits up to this many milliseconds for the process to end; true when it has ended, or was never started.
  bool WaitForEnd(std::uint32_t milliseconds) const;

 private:
  friend Process CreateProcessA(const std::string&, std::uint32_t, const std::string&);
  friend Process ShellExecuteExA(const std::string&, const std::string&, const std::string&, const std::string&);
  std::intptr_t process_ = 0;
  std::intptr_t thread_ = 0;
  bool needsElevation_ = false;
};

// Starts the program at the beginning of the command line, which is passed on as it stands. The new process has the
// program's environment, inherits its handles, and works in `directory` (empty: the program's own current
// directory; one that does not exist: nothing is started). With a NUL in either text nothing is started.
Process CreateProcessA(const std::string& commandLine, std::uint32_t creationFlags, const std::string& directory);

// Has the shell start a program: with the verb "runas" as an administrator, once the person has agreed. The parameters
// are passed on as they stand, the priority is normal, and the directory is as above. Not started when the person
// refuses, or with a NUL in any of the texts; no error is shown.
Process ShellExecuteExA(const std::string& verb, const std::string& file, const std::string& parameters,
                        const std::string& directory);

}  // namespace platform

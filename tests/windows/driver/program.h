// Another program, started and ended by a test.
#pragma once

#include <windows.h>

#include <string>

namespace driver {

// A running program with all that it starts: at the end of its life, or of the test's process, they are ended.
class Program {
 public:
  explicit Program(std::string commandLine, const std::string& directory = "");
  ~Program();
  Program(const Program&) = delete;
  Program& operator=(const Program&) = delete;

  DWORD Id() const { return process_.dwProcessId; }
  bool HasEnded() const;

 private:
  HANDLE job_;
  PROCESS_INFORMATION process_{};
};

// Runs a program to its end and gives what it wrote; its output in the console's code page is converted.
std::string OutputOf(std::string commandLine);

// Starts a program of the Linux machine below Wine; how it ends cannot be told, only what it does.
void StartOnHost(std::string commandLine);

}  // namespace driver

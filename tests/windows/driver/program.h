// Another program, started and ended by a test.
#pragma once

#include <windows.h>

#include <string>

// A running program with all that it starts: at the end of its life, or of the test's process, they are ended. Usually
// it works in C:\, which is no directory of its own.
class Program {
 public:
  explicit Program(std::string commandLine, const std::string& directory = "C:\\");
  ~Program();
  Program(const Program&) = delete;
  Program& operator=(const Program&) = delete;

  DWORD Id() const { return process_.dwProcessId; }
  DWORD ExitCode() const;  // once it has ended: 0 when nothing went wrong
  bool HasEnded() const { return WaitForSingleObject(process_.hProcess, 0) == WAIT_OBJECT_0; }

 private:
  HANDLE job_;
  PROCESS_INFORMATION process_{};
};

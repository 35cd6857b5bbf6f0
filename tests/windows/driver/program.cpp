#include "tests/windows/driver/program.h"

#include <array>

#include "tests/windows/driver/waiting.h"

namespace driver {

namespace {

// Everything that is put into the job ends when its last handle is closed, however the test ends.
HANDLE NewJob() {
  const HANDLE job = CreateJobObjectA(nullptr, nullptr);
  JOBOBJECT_EXTENDED_LIMIT_INFORMATION limits{};
  limits.BasicLimitInformation.LimitFlags = JOB_OBJECT_LIMIT_KILL_ON_JOB_CLOSE;
  SetInformationJobObject(job, JobObjectExtendedLimitInformation, &limits, sizeof limits);
  return job;
}

PROCESS_INFORMATION Start(std::string& commandLine, const char* directory, DWORD flags, STARTUPINFOA& how) {
  PROCESS_INFORMATION process{};
  how.cb = sizeof how;
  EXPECT_TRUE(CreateProcessA(nullptr, commandLine.data(), nullptr, nullptr, how.hStdOutput != nullptr, flags, nullptr,
                             directory, &how, &process))
      << commandLine << " does not start: error " << GetLastError();
  return process;
}

void Release(const PROCESS_INFORMATION& process) {
  CloseHandle(process.hThread);
  CloseHandle(process.hProcess);
}

}  // namespace

Program::Program(std::string commandLine, const std::string& directory) : job_(NewJob()) {
  STARTUPINFOA how{};
  process_ = Start(commandLine, directory.empty() ? nullptr : directory.c_str(), CREATE_SUSPENDED, how);
  AssignProcessToJobObject(job_, process_.hProcess);
  ResumeThread(process_.hThread);
}

Program::~Program() {
  TerminateJobObject(job_, 1);
  WaitForSingleObject(process_.hProcess, Limit);
  Release(process_);
  CloseHandle(job_);
}

bool Program::HasEnded() const { return WaitForSingleObject(process_.hProcess, 0) == WAIT_OBJECT_0; }

std::string OutputOf(std::string commandLine) {
  SECURITY_ATTRIBUTES inherited{sizeof inherited, nullptr, TRUE};
  HANDLE read = nullptr;
  HANDLE write = nullptr;
  CreatePipe(&read, &write, &inherited, 0);
  SetHandleInformation(read, HANDLE_FLAG_INHERIT, 0);
  STARTUPINFOA how{};
  how.dwFlags = STARTF_USESTDHANDLES;
  how.hStdOutput = how.hStdError = write;
  const PROCESS_INFORMATION process = Start(commandLine, nullptr, CREATE_NO_WINDOW, how);
  CloseHandle(write);
  std::string output;
  std::array<char, 4096> part{};
  for (DWORD length = 0; ReadFile(read, part.data(), DWORD{part.size()}, &length, nullptr) && length != 0;) {
    output.append(part.data(), length);
  }
  CloseHandle(read);
  Release(process);
  OemToCharBuffA(output.data(), output.data(), static_cast<DWORD>(output.size()));
  return output;
}

void StartOnHost(std::string commandLine) {
  STARTUPINFOA how{};
  Start(commandLine, nullptr, 0, how);
}

}  // namespace driver

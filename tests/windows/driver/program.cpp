#include "tests/windows/driver/program.h"

#include "tests/windows/driver/waiting.h"

// Everything that is put into the job ends when its last handle is closed, however the test ends.
Program::Program(std::string commandLine, const std::string& directory) : job_(CreateJobObjectA(nullptr, nullptr)) {
  JOBOBJECT_EXTENDED_LIMIT_INFORMATION limits{};
  limits.BasicLimitInformation.LimitFlags = JOB_OBJECT_LIMIT_KILL_ON_JOB_CLOSE;
  SetInformationJobObject(job_, JobObjectExtendedLimitInformation, &limits, sizeof limits);
  STARTUPINFOA how{};
  how.cb = sizeof how;
  EXPECT_TRUE(CreateProcessA(nullptr, commandLine.data(), nullptr, nullptr, FALSE, CREATE_SUSPENDED, nullptr,
                             directory.c_str(), &how, &process_))
      << commandLine << " does not start: error " << GetLastError();
  AssignProcessToJobObject(job_, process_.hProcess);
  ResumeThread(process_.hThread);
}

DWORD Program::ExitCode() const {
  DWORD code = STILL_ACTIVE;
  GetExitCodeProcess(process_.hProcess, &code);
  return code;
}

Program::~Program() {
  TerminateJobObject(job_, 1);
  WaitForSingleObject(process_.hProcess, Limit);
  CloseHandle(process_.hThread);
  CloseHandle(process_.hProcess);
  CloseHandle(job_);
}

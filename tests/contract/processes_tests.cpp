#include <tuple>

#include "platform/environment.h"
#include "platform/processes.h"
#include "tests/contract/machine.h"

namespace {

using namespace contract;

class Processes : public Machine {};

TEST_F(Processes, WorkInTheirDirectoryAndAreWaitedForUnlessTheyCannotBeStarted) {
  const string program = StandIn(), directory = here_ + "A\xE7\xE3o e mais", note = directory + "\\here";
  EXPECT_TRUE(CreateDirectoryA(directory));
  const std::tuple<string, string, bool> cases[] = {
      {program, directory, true},         {program, directory + "\\", true},  {program, here_ + "nowhere", false},
      {program, directory + Zero, false}, {program + Zero, directory, false}, {here_ + "nowhere", directory, false}};
  for (const auto& [commandLine, where, starts] : cases) {
    const Process process = CreateProcessA(commandLine, PriorityIdle, where);
    EXPECT_EQ(process.Started(), starts) << commandLine << " in " << where;
    EXPECT_TRUE(!process.WaitForEnd(0) || FileSize(note).has_value() == starts);
    EXPECT_TRUE(process.WaitForEnd(20'000));
    EXPECT_EQ(DeleteFileA(note), starts);
  }
}

TEST_F(Processes, OfTheShellWorkInTheirDirectoryAndAreWaitedForToo) {
  const string line = StandIn() + " ", program = line.substr(0, line.find(' ')),
               parameters = line.substr(program.size());
  const string directory = here_ + "A\xE7\xE3o e mais", note = directory + "\\here";
  EXPECT_TRUE(CreateDirectoryA(directory));
  const std::tuple<const char*, string, string, bool> cases[] = {
      {"a program", program, parameters, true},
      {"a missing one", here_ + "nowhere.exe", parameters, false},
      {"a path that names nothing", program + Zero, parameters, false},
      {"parameters that are cut", program, parameters + Zero, false},
  };
  for (const auto& [name, file, arguments, starts] : cases) {
    const Process process = ShellExecuteExA("runas", file, arguments, directory);
    EXPECT_EQ(process.Started(), starts) << name;
    EXPECT_FALSE(process.NeedsElevation()) << name;
    EXPECT_TRUE(process.WaitForEnd(0) || process.WaitForEnd(20'000)) << name;
    EXPECT_EQ(DeleteFileA(note), starts) << name;
  }
}

TEST_F(Processes, EnvironmentIsReadWithoutRegardToCase) {
  for (const string& value : {string("C:\\Jogos;D:\\A\xE7\xE3o"), string(3000, 'x'), string()}) {
    SetEnvironment("Tolvaris_Teste", value);
    EXPECT_EQ(GetEnvironmentVariableA("TOLVARIS_teste"), value);
  }
}

}  // namespace

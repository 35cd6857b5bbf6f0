#include <tuple>

#include "platform/environment.h"
#include "platform/processes.h"
#include "tests/contract/machine.h"

namespace {

using namespace contract;

class Processes : public Machine {};

TEST_F(Processes, StartWithTheirCommandLineDirectoryAndPriority) {
  const std::tuple<std::uint32_t, string, string> cases[] = {
      {PriorityNormal, "Um\\", ""},
      {PriorityIdle, "Um", " C:\\Jogos\\JOGOUM~1.SMC"},
      {PriorityHigh, "A\xE7\xE3o e mais", "  \"a b\"  -c A\xE7\xE3o "}};
  for (const auto& [priority, name, arguments] : cases) {
    const string commandLine = StandIn() + arguments, directory = here_ + name, note = directory + "\\here.txt";
    CreateDirectoryA(directory);
    DeleteFileA(note);
    Process process = CreateProcessA(commandLine, priority, directory);
    EXPECT_TRUE(process.Started() && !process.WaitForEnd(0) && !FileSize(note));
    TellStandInToEnd();
    const Process moved = std::move(process);
    EXPECT_FALSE(process.Started());
    for (const std::uint32_t limit : {20'000u, 0u}) EXPECT_TRUE(moved.WaitForEnd(limit));
    EXPECT_EQ(Content(note), std::to_string(IsWine() ? PriorityNormal : priority) + " " + commandLine);
  }
}

TEST_F(Processes, WhatCannotBeStartedIsNotAndHasEnded) {
  const string program = StandIn(), nowhere = here_ + "nowhere";
  const std::pair<string, string> cases[] = {
      {nowhere, ""}, {"", here_}, {program, nowhere}, {program + Zero, here_}, {program, here_ + Zero}};
  for (const auto& [commandLine, directory] : cases) {
    const Process process = CreateProcessA(commandLine, PriorityNormal, directory);
    EXPECT_TRUE(!process.Started() && process.WaitForEnd(0)) << commandLine << " in " << directory;
  }
}

TEST_F(Processes, EnvironmentIsReadWithoutRegardToCase) {
  for (const string& value : {string("C:\\Jogos;D:\\A\xE7\xE3o"), string(3000, 'x'), string()}) {
    SetEnvironment("Tolvaris_Teste", value);
    EXPECT_EQ(GetEnvironmentVariableA("TOLVARIS_teste"), value);
  }
}

}  // namespace

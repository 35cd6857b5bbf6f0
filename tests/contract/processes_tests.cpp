#include <gtest/gtest.h>

#include <algorithm>

#include "platform/files.h"
#include "platform/processes.h"
#include "tests/contract/machine.h"

namespace {

using platform::CreateProcessA;
using platform::Process;

constexpr std::uint32_t Limit = 20'000;

std::string Content(const std::string& path) {
  platform::File file(path, platform::Access::Read);
  std::string content(static_cast<std::size_t>(std::max<std::int64_t>(file.Size(), 0)), '\0');
  file.Read(0, content.data(), content.size());
  return content;
}

TEST(Processes, StartWithTheirCommandLineDirectoryAndPriority) {
  struct {
    std::uint32_t Priority;
    std::string Directory, Arguments;
  } const cases[] = {{platform::PriorityNormal, "Um", ""},
                     {platform::PriorityIdle, "Um", " C:\\Jogos\\JOGOUM~1.SMC"},
                     {platform::PriorityHigh, "A\xE7\xE3o e mais\\", "  \"a b\"  -c A\xE7\xE3o "}};
  const contract::FreshDirectory directory;
  for (const auto& each : cases) {
    contract::StandIn program;
    const std::string place = directory / each.Directory;
    const std::string note = place + (place.ends_with('\\') ? "" : "\\") + "here.txt";
    platform::CreateDirectoryA(place);
    platform::DeleteFileA(note);

    Process process = CreateProcessA(program.CommandLine() + each.Arguments, each.Priority, place);
    ASSERT_TRUE(process.Started());
    EXPECT_FALSE(process.WaitForEnd(0));
    EXPECT_FALSE(platform::FileSize(note));
    program.TellToEnd();
    const Process moved = std::move(process);
    EXPECT_FALSE(process.Started());
    EXPECT_TRUE(moved.WaitForEnd(Limit));
    EXPECT_TRUE(moved.WaitForEnd(0));
    const std::uint32_t priority = contract::StartsWithPriority() ? each.Priority : platform::PriorityNormal;
    EXPECT_EQ(Content(note), std::to_string(priority) + " " + program.CommandLine() + each.Arguments);
  }
}

TEST(Processes, WhatCannotBeStartedIsNotAndHasEnded) {
  const contract::FreshDirectory directory;
  const contract::StandIn program;
  const std::string zero(1, '\0');
  struct {
    std::string CommandLine, Directory;
  } const cases[] = {{directory / "nothing.exe", ""},
                     {"", directory.Path()},
                     {program.CommandLine(), directory / "nowhere"},
                     {program.CommandLine() + zero, directory.Path()},
                     {program.CommandLine(), directory.Path() + zero}};
  for (const auto& each : cases) {
    const Process process = CreateProcessA(each.CommandLine, platform::PriorityNormal, each.Directory);
    EXPECT_FALSE(process.Started()) << each.CommandLine << " in " << each.Directory;
    EXPECT_TRUE(process.WaitForEnd(0));
  }
}

}  // namespace

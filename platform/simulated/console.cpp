#include "platform/console.h"

#include <utility>

#include "platform/simulated/machine.h"
#include "platform/text.h"

namespace platform {

using simulated::TheMachine;

std::vector<Argument> CommandLineArguments() { return TheMachine().Arguments; }

bool IsConsole(Stream /*stream*/) { return TheMachine().HasConsole; }

bool WriteStream(Stream stream, std::string_view utf8) {
  if (simulated::Fails()) return false;
  TheMachine().Streams[stream] += utf8;
  return true;
}

// Whoever looks at the clock has worked meanwhile.
std::uint64_t GetTickCount64() { return TheMachine().Ticks += 100; }

}  // namespace platform

namespace platform::simulated {

void SetArguments(const std::vector<std::string>& utf8) {
  TheMachine().Arguments.clear();
  for (const std::string& each : utf8) TheMachine().Arguments.push_back({each, FromUtf8Exactly(each)});
}

void UseConsole() { TheMachine().HasConsole = true; }

std::string TakeStream(Stream stream) { return std::exchange(TheMachine().Streams[stream], {}); }

}  // namespace platform::simulated

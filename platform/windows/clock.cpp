#include "platform/clock.h"

#include <windows.h>

#include <array>
#include <cstdio>

namespace platform {

// The system counts from 1601, in units of 100 nanoseconds.
std::int64_t SystemTime() {
  constexpr std::int64_t second = 10'000'000, from1601To1970 = 11'644'473'600;
  FILETIME now = {};
  ::GetSystemTimeAsFileTime(&now);
  const auto units = static_cast<std::int64_t>(std::uint64_t{now.dwHighDateTime} << 32 | now.dwLowDateTime);
  return units / second - from1601To1970;
}

std::string LocalDate() {
  SYSTEMTIME now = {};
  ::GetLocalTime(&now);
  std::array<char, 40> text{};
  std::snprintf(text.data(), text.size(), "%04d-%02d-%02d", now.wYear, now.wMonth, now.wDay);
  return text.data();
}

}  // namespace platform

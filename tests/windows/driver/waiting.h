// Waiting for what the program under test does, with a limit.
#pragma once

#include <gtest/gtest.h>
#include <windows.h>

inline constexpr DWORD Limit = 15000;  // milliseconds; far more than anything here takes

// Asks again and again until the condition holds; false when it still does not at the limit.
template <typename Condition>
bool Eventually(Condition condition, DWORD limit = Limit) {
  const ULONGLONG end = GetTickCount64() + limit;
  while (!condition()) {
    if (GetTickCount64() > end) return false;
    ::Sleep(5);
  }
  return true;
}

// What `get` gives as soon as it is as expected, or at the limit.
template <typename Value, typename Get>
Value Awaited(const Value& expected, Get get) {
  Value seen = get();
  Eventually([&] { return (seen = get()) == expected; });
  return seen;
}

// The expression comes to equal the expected value; when it does not, the failure shows its last value.
#define EXPECT_SOON_EQ(expected, expression) EXPECT_EQ(expected, Awaited(expected, [&] { return expression; }))
#define EXPECT_SOON(condition) EXPECT_TRUE(Eventually([&] { return static_cast<bool>(condition); })) << #condition
#define ASSERT_SOON(condition) ASSERT_TRUE(Eventually([&] { return static_cast<bool>(condition); })) << #condition

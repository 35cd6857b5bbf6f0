// When to kill the program: moments of an operation that were measured while nothing came between.
#pragma once

#include <functional>
#include <random>

#include "tests/windows/installation.h"

// What the name of a file of the program's ends with while it is being written.
inline const std::string Leftover = ".novo~";

// The length of a file in bytes; 0 when it is missing.
inline size_t SizeOf(const std::string& path) {
  WIN32_FILE_ATTRIBUTE_DATA data{};
  return GetFileAttributesExA(path.c_str(), GetFileExInfoStandard, &data) ? data.nFileSizeLow : 0;
}

class Moments {
 public:
  // Half-written files are looked for in the directories of these.
  explicit Moments(const Files& files);

  // The operation begins now.
  void Begin() { begin_ = Now(); }

  // Measures it up to its end.
  void Watch(const std::function<bool()>& ended);

  // Waits for a moment at random: since its begin, or while it writes, that is since the first half-written file is
  // there. An operation that has ended is not waited for.
  void AwaitOne(const std::function<bool()>& ended, bool whileWriting);

  std::string Text() const;  // what was measured

 private:
  static double Now();  // milliseconds
  double Passed() const { return Now() - begin_; }
  bool Writing() const;
  void Wait(double milliseconds, const std::function<bool()>& ended) const;

  std::set<std::string> patterns_;
  double begin_ = 0, whole_ = 0, firstWrite_ = 0, lastWrite_ = 0;
  std::mt19937 random_{std::random_device{}()};
};

// What the programs that ./bench runs under Wine have in common: times, and how they are told.
#pragma once

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <vector>

namespace benchmarks {

class Stopwatch {
 public:
  double Milliseconds() const {
    return std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start_).count();
  }

 private:
  std::chrono::steady_clock::time_point start_ = std::chrono::steady_clock::now();
};

inline double Median(std::vector<double> values) {
  std::sort(values.begin(), values.end());
  return values.empty() ? 0 : values[values.size() / 2];
}

// One line: the name, a tab, the median in the unit that the table of figures gives.
inline void Tell(const char* name, const std::vector<double>& values) {
  std::printf("%s\t%.4f\n", name, Median(values));
  std::fflush(stdout);
}

}  // namespace benchmarks

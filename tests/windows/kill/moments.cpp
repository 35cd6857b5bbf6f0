#include "tests/windows/kill/moments.h"

#include <sstream>

Moments::Moments(const Files& files) {
  for (const auto& [path, content] : files) patterns_.insert(path.substr(0, path.rfind('\\') + 1) + "*" + Leftover);
}

double Moments::Now() {
  LARGE_INTEGER count{}, frequency{};
  QueryPerformanceCounter(&count);
  QueryPerformanceFrequency(&frequency);
  return 1000.0 * static_cast<double>(count.QuadPart) / static_cast<double>(frequency.QuadPart);
}

bool Moments::Writing() const {
  for (const std::string& pattern : patterns_) {
    WIN32_FIND_DATAA found{};
    const HANDLE search = FindFirstFileA(pattern.c_str(), &found);
    if (search == INVALID_HANDLE_VALUE) continue;
    FindClose(search);
    return true;
  }
  return false;
}

void Moments::Watch(const std::function<bool()>& ended) {
  double first = -1, last = -1;
  while (!ended() && Passed() < Limit) {
    if (!Writing()) continue;
    last = Passed();
    if (first < 0) first = last;
  }
  whole_ = Passed();
  firstWrite_ = first < 0 ? whole_ : first;
  lastWrite_ = first < 0 ? whole_ : last;
}

// Sleeping is only as exact as the system's clock.
void Moments::Wait(double milliseconds, const std::function<bool()>& ended) const {
  const double until = Now() + milliseconds;
  while (Now() < until && (until - Now() < 5 || !ended())) {
    if (until - Now() > 5) ::Sleep(1);
  }
}

// What is written too quickly to be seen is killed around the moment at which it was last written.
void Moments::AwaitOne(const std::function<bool()>& ended, bool whileWriting) {
  constexpr double quick = 3;  // milliseconds
  const double writes = lastWrite_ - firstWrite_;
  const auto atRandom = [&](double from, double to) { return std::uniform_real_distribution(from, to)(random_); };
  if (!whileWriting) return Wait(atRandom(0, whole_), ended);
  if (writes < quick) return Wait(firstWrite_ + atRandom(-2 * quick, quick), [] { return false; });
  while (!Writing() && !ended() && Passed() < Limit) continue;
  Wait(atRandom(0, writes), ended);
}

std::string Moments::Text() const {
  std::ostringstream text;
  text << "takes " << whole_ << " ms and writes from " << firstWrite_ << " to " << lastWrite_ << " ms";
  return text.str();
}

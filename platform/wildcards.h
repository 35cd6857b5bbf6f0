// Wildcard patterns of file listings; the same on every platform.
#pragma once

#include <cstddef>
#include <string_view>

namespace platform {

// Whether the whole name is what the pattern says: "*" stands for any number of characters, "?" for one. Letter case
// counts, so the caller gives both texts in upper case.
inline bool MatchesPattern(std::string_view name, std::string_view pattern) {
  std::size_t at = 0, next = 0;
  std::size_t star = std::string_view::npos, resume = 0;  // the last "*", and where the name goes on behind it
  while (at < name.size()) {
    if (next < pattern.size() && pattern[next] == '*') {
      star = next++;
      resume = at;
    } else if (next < pattern.size() && (pattern[next] == '?' || pattern[next] == name[at])) {
      ++at, ++next;
    } else if (star != std::string_view::npos) {
      next = star + 1;
      at = ++resume;
    } else {
      return false;
    }
  }
  return pattern.find_first_not_of('*', next) == std::string_view::npos;
}

// The same for a list of patterns with ";" between them: one of them is enough.
inline bool MatchesAnyPattern(std::string_view name, std::string_view patterns) {
  for (std::size_t start = 0; start <= patterns.size();) {
    const std::size_t end = patterns.find(';', start);
    const std::string_view pattern = patterns.substr(start, end - start);
    if (!pattern.empty() && MatchesPattern(name, pattern)) return true;
    if (end == std::string_view::npos) break;
    start = end + 1;
  }
  return false;
}

}  // namespace platform

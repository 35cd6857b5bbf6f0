// What the fuzz targets share. Each of them defines Test; a property that does not hold is a finding.
#pragma once

#include <cstdlib>
#include <string_view>

// Looks at what the program makes of one input.
void Test(std::string_view input);

// Ends the run as a finding when what must hold does not.
inline void Require(bool holds) {
  if (!holds) std::abort();
}

// The input up to its next line feed, or all of it; it is taken off the front, with the line feed.
inline std::string_view TakeLine(std::string_view& input) {
  const std::size_t end = input.find('\n');
  const std::string_view line = input.substr(0, end);
  input.remove_prefix(end == std::string_view::npos ? input.size() : end + 1);
  return line;
}

// Decoded pictures as plain memory.
#pragma once

#include <cstdint>
#include <vector>

namespace platform {

inline constexpr std::int64_t MostPixels = 64'000'000;

// Rows from the top, a pixel 0x00RRGGBB.
struct Pixels {
  int Width = 0, Height = 0;
  std::vector<std::uint32_t> Colours;
};

}  // namespace platform

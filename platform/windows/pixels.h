// Decoded pictures as plain memory.
#pragma once

#include <cstdint>
#include <vector>

namespace platform {

// Rows from the top, a pixel 0x00RRGGBB.
struct Pixels {
  int Width = 0, Height = 0;
  std::vector<std::uint32_t> Colours;
};

}  // namespace platform

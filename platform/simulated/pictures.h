// A picture of the machine in memory: where it came from.
#pragma once

#include <string>

namespace platform {

struct PictureData {
  int Resource = 0;  // 0: it came from a file's content
  std::string Content;
};

}  // namespace platform

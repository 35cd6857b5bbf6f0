// Whether a picture file holds all that it announces. The system's decoders also show what is left of a truncated one.
#pragma once

#include <string_view>

namespace platform {

// The file begins as its format does.
bool BmpIsWhole(std::string_view content);
bool JpegIsWhole(std::string_view content);

}  // namespace platform

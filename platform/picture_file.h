// What a picture file says of itself, found out without decoding it.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>

namespace platform {

// No picture may say that it is larger: in pixels, which still lets a scan of 50 megapixels through, and along one
// side.
inline constexpr std::int64_t MostPixels = 64'000'000;
inline constexpr std::int64_t MostSide = 65'535;

enum class PictureFormat { Gif, Bmp, Jpeg, Png };

struct PictureFile {
  PictureFormat Format;
  int Width, Height;   // of the first frame, pixels
  std::size_t Length;  // what the first frame takes up, from the file's beginning
};

// Nothing when the content is of none of the formats, when it is cut before the first frame's end, and when any size in
// it, up to that end, cannot be or is too large for what the file holds. Only the bytes that fill up a bitmap's last
// row may be missing: up to three, which Length counts.
std::optional<PictureFile> ReadPictureFile(std::string_view content);

}  // namespace platform

// Making picture files.
#pragma once

#include <algorithm>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace platform {

struct PixelSize {
  int Width, Height;  // pixels
  bool operator==(const PixelSize&) const = default;
};

// The size in which a picture fits into another one, its shape kept; a smaller one stays as it is.
inline PixelSize Fitted(PixelSize picture, PixelSize most) {
  const auto wide = std::int64_t{picture.Width} * most.Height, high = std::int64_t{picture.Height} * most.Width;
  if (picture.Width <= most.Width && picture.Height <= most.Height) return picture;
  const auto part = [](std::int64_t side, std::int64_t of, std::int64_t whole) {
    return static_cast<int>(std::max<std::int64_t>((side * of + whole / 2) / whole, 1));
  };
  return wide >= high ? PixelSize{most.Width, part(picture.Height, most.Width, picture.Width)}
                      : PixelSize{part(picture.Width, most.Height, picture.Height), most.Height};
}

// A JPEG file of the first frame of any picture that the system can decode, fitted into this size, over white where it
// is transparent. Nothing when the system decodes no picture from the content, or one that is too large
// (picture_file.h).
std::optional<std::string> MakeJpeg(std::string_view content, PixelSize most);

// A JPEG file of this size with the text in its middle, in as large letters as there is room for. Nothing when the
// system cannot draw or encode it.
std::optional<std::string> DrawJpeg(const std::string& text, PixelSize size);

}  // namespace platform

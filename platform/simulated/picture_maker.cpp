// The files that are made here say which size they have and what they are of, and show nothing.
#include "platform/picture_maker.h"

#include "platform/picture_file.h"
#include "platform/simulated/machine.h"

namespace platform {
namespace {

std::string High(std::size_t number) { return {static_cast<char>(number >> 8), static_cast<char>(number & 0xFF)}; }

// A segment of a JPEG file: its kind, its length and its data.
std::string Segment(char kind, const std::string& data) {
  return std::string{'\xFF', kind} + High(data.size() + 2) + data;
}

std::string Jpeg(PixelSize size, const std::string& of) {
  constexpr std::size_t pixelsPerByte = 256;  // no file that is shorter could hold so many
  const std::size_t pixels = static_cast<std::size_t>(size.Width) * static_cast<std::size_t>(size.Height);
  const std::string frame = "\x08" + High(static_cast<std::size_t>(size.Height)) +
                            High(static_cast<std::size_t>(size.Width)) + std::string("\x01\x01\x11\x00", 4);
  return "\xFF\xD8" + Segment('\xFE', of + std::string(pixels / pixelsPerByte, ' ')) + Segment('\xC0', frame) +
         Segment('\xDA', std::string("\x01\x01\x00\x00\x3F\x00", 6)) + "\xFF\xD9";
}

}  // namespace

std::optional<std::string> MakeJpeg(std::string_view content, PixelSize most) {
  const auto picture = ReadPictureFile(content);
  if (simulated::Fails() || !picture) return std::nullopt;
  return Jpeg(Fitted({picture->Width, picture->Height}, most), std::to_string(content.size()));
}

std::optional<std::string> DrawJpeg(const std::string& text, PixelSize size) {
  if (simulated::Fails()) return std::nullopt;
  return Jpeg(size, text);
}

}  // namespace platform

// The smallest picture files, byte by byte.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <string>

namespace contract {

struct PictureSize {
  std::uint32_t Width, Height;
};

inline std::string Bytes(std::initializer_list<int> values) { return std::string(values.begin(), values.end()); }

// A number, its lowest byte first.
inline std::string Low(std::uint64_t value, int bytes) {
  std::string text;
  for (; bytes > 0; --bytes, value >>= 8) text += static_cast<char>(value & 0xFF);
  return text;
}

// One row of three pixels, 8 bits each, all of the colour 0x404040, whatever the size says.
inline std::string SmallBmp(PictureSize size = {3, 1}) {
  constexpr std::uint32_t start = 14 + 40 + 4 * 256;
  return "BM" + Low(start + 4, 4) + Low(0, 4) + Low(start, 4) + Low(40, 4) + Low(size.Width, 4) + Low(size.Height, 4) +
         Low(1, 2) + Low(8, 2) + std::string(24, '\0') + std::string(4 * 256, '\x40') + Bytes({1, 2, 3, 0});
}

// Indices 0, 1, 1, 0 of the colours red (transparent) and blue. The codes are 4 (start afresh), 0, 1, 1 of three bits,
// then 0 and 5 (end) of four. The file ends with its first image, which is all that counts.
inline std::string SmallGif(PictureSize size = {2, 2}, const std::string& codes = Bytes({0x44, 0x02, 0x05})) {
  const std::string sides = Low(size.Width, 2) + Low(size.Height, 2);
  return "GIF89a" + sides + Bytes({0x80, 0, 0, 255, 0, 0, 0, 0, 255, 0x21, 0xF9, 4, 1, 0, 0, 0, 0, 0x2C, 0, 0, 0, 0}) +
         sides + Bytes({0, 2}) + Low(codes.size(), 1) + codes + '\0';
}

// One block of 8 by 8 pixels in middle grey: each Huffman table has one code, of one bit, and it means zero.
inline std::string SmallJpeg(PictureSize size = {8, 8}) {
  const auto high = [](std::uint32_t value) { return Low(value >> 8, 1) + Low(value, 1); };
  const auto table = [](int kind) { return Bytes({0xFF, 0xC4, 0, 20, kind, 1}) + std::string(16, '\0'); };
  return Bytes({0xFF, 0xD8, 0xFF, 0xDB, 0, 67, 0}) + std::string(64, '\x01') + Bytes({0xFF, 0xC0, 0, 11, 8}) +
         high(size.Height) + high(size.Width) + Bytes({1, 1, 0x11, 0}) + table(0x00) + table(0x10) +
         Bytes({0xFF, 0xDA, 0, 8, 1, 1, 0, 0, 63, 0, 0x3F, 0xFF, 0xD9});
}

// Indices 0, 1, 1, 0 of the colours red (transparent) and blue. The checksums are those of the usual size.
inline std::string SmallPng(PictureSize size = {2, 2}) {
  const auto high = [](std::uint32_t value) {
    const std::string low = Low(value, 4);
    return std::string(low.rbegin(), low.rend());
  };
  const auto chunk = [&](const char* kind, const std::string& data, std::uint32_t checksum) {
    return high(static_cast<std::uint32_t>(data.size())) + kind + data + high(checksum);
  };
  return "\x89PNG\r\n\x1A\n" +
         chunk("IHDR", high(size.Width) + high(size.Height) + Bytes({8, 3, 0, 0, 0}), 0x4568FD16) +
         chunk("PLTE", Bytes({255, 0, 0, 0, 0, 255}), 0x6CA1FD8E) + chunk("tRNS", std::string(1, '\0'), 0x40E6D866) +
         chunk("IDAT", Bytes({120, 218, 99, 96, 96, 4, 66, 0, 0, 12, 0, 3}), 0x159E18FC) +
         chunk("IEND", "", 0xAE426082);
}

}  // namespace contract

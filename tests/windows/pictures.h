// Picture files of one colour.
#pragma once

#include <windows.h>

#include <string>

inline std::string LittleEndian(DWORD number, int bytes) {
  std::string text;
  for (int i = 0; i < bytes; ++i) text += static_cast<char>(number >> (8 * i));
  return text;
}

// A BMP file of 24 bits a pixel.
inline std::string Bmp(COLORREF colour, DWORD width, DWORD height) {
  const DWORD row = (width * 3 + 3) / 4 * 4;
  std::string file = "BM" + LittleEndian(54 + row * height, 4) + LittleEndian(0, 4) + LittleEndian(54, 4) +
                     LittleEndian(40, 4) + LittleEndian(width, 4) + LittleEndian(height, 4) + LittleEndian(1, 2) +
                     LittleEndian(24, 2) + std::string(24, '\0');
  std::string line;
  for (DWORD x = 0; x < width; ++x) {
    line += {static_cast<char>(GetBValue(colour)), static_cast<char>(GetGValue(colour)),
             static_cast<char>(GetRValue(colour))};
  }
  line.resize(row);
  for (DWORD y = 0; y < height; ++y) file += line;
  return file;
}

// A GIF file of one pixel.
inline std::string Gif(COLORREF colour) {
  const std::string size = LittleEndian(1, 2) + LittleEndian(1, 2);
  return "GIF89a" + size + std::string("\x80\0\0", 3) + LittleEndian(colour, 3) + std::string(3, '\0') + "," +
         std::string(4, '\0') + size + std::string("\0\2\2\x44\1\0;", 7);
}

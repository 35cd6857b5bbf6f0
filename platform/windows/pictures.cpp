#include "platform/windows/pictures.h"

#include <algorithm>
#include <cstdlib>
#include <utility>

#include "platform/windows/wic.h"

namespace platform {
namespace {

// A resource of the program, which stays where it is for as long as the program runs; empty when there is none.
std::string_view Resource(int id) {
  const HRSRC found = ::FindResourceA(nullptr, MAKEINTRESOURCEA(id), RT_RCDATA);
  const HGLOBAL loaded = found != nullptr ? ::LoadResource(nullptr, found) : nullptr;
  if (loaded == nullptr) return {};
  return {static_cast<const char*>(::LockResource(loaded)), ::SizeofResource(nullptr, found)};
}

// A GIF file's decoder would decode all its images; a bitmap's last row is filled up.
void Complete(std::string& content, const PictureFile& file) {
  if (file.Format == PictureFormat::Gif) {
    content.resize(file.Length);
    content += ';';  // the end
  }
  if (file.Format == PictureFormat::Bmp) content.resize(std::max(content.size(), file.Length));
}

// Where the picture and its place differ by one row or column, that one is left out or doubled; to mix all of them
// takes four times as long and blurs them.
bool Fits(int image, int area) { return std::abs(area - image) <= 1; }

// How many rows or columns are drawn: all but one at the end that is too many.
int Drawn(int image, int area) { return image == area + 1 ? area : image; }

}  // namespace

Picture LoadPicture(std::string content) {
  try {
    const std::optional<PictureFile> file = ReadPictureFile(content);
    if (!file) return {};
    Complete(content, *file);
    return Picture(std::make_shared<const PictureData>(PictureData{std::move(content), *file, {}}));
  } catch (const std::exception&) {  // not enough memory
    return {};
  }
}

Picture LoadPictureResource(int id) { return LoadPicture(std::string(Resource(id))); }

const Pixels* PixelsFor(const Picture& picture, SIZE place) {
  const PictureData& data = *picture.Data();
  DecodedPicture& decoded = data.Decoded;
  if (decoded.Place.cx != place.cx || decoded.Place.cy != place.cy) {
    decoded.Place = place;
    decoded.Image.reset();
    try {
      // One row and column too many are left out in drawing, and not mixed with the others.
      decoded.Image = Decode(data.Content, data.File.Format, {place.cx + 1, place.cy + 1});
    } catch (const std::exception&) {  // not enough memory
    }
  }
  return decoded.Image ? &*decoded.Image : nullptr;
}

bool DrawPicture(HDC context, const RECT& area, const Picture& picture) {
  const int width = area.right - area.left, height = area.bottom - area.top;
  const Pixels* const decoded = picture ? PixelsFor(picture, {width, height}) : nullptr;
  if (decoded == nullptr) return false;
  const Pixels& image = *decoded;
  const int columns = Drawn(image.Width, width), rows = Drawn(image.Height, height);
  BITMAPINFO format{};
  format.bmiHeader.biSize = sizeof format.bmiHeader;
  format.bmiHeader.biWidth = image.Width;
  format.bmiHeader.biHeight = -rows;  // rows from the top
  format.bmiHeader.biPlanes = 1;
  format.bmiHeader.biBitCount = 32;
  ::SetStretchBltMode(context, Fits(image.Width, width) && Fits(image.Height, height) ? COLORONCOLOR : HALFTONE);
  ::SetBrushOrgEx(context, 0, 0, nullptr);
  ::StretchDIBits(context, area.left, area.top, width, height, 0, 0, columns, rows, image.Colours.data(), &format,
                  DIB_RGB_COLORS, SRCCOPY);
  return true;
}

}  // namespace platform

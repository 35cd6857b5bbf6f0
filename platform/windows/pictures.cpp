#include "platform/pictures.h"

#include <windows.h>

#include <algorithm>
#include <optional>
#include <string>
#include <utility>

#include "platform/picture_file.h"
#include "platform/windows/drawing.h"
#include "platform/windows/resource.h"
#include "platform/windows/wic.h"

namespace platform {
namespace {

// A GIF file's decoder would decode all its images; a bitmap's last row is filled up.
void Complete(std::string& content, const PictureFile& file) {
  if (file.Format == PictureFormat::Gif) {
    content.resize(file.Length);
    content += ';';  // the end
  }
  if (file.Format == PictureFormat::Bmp) content.resize(std::max(content.size(), file.Length));
}

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

Picture LoadPictureResource(int id) { return LoadPicture(std::string(Resource(id, RT_RCDATA))); }

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

}  // namespace platform

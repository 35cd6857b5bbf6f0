#include "platform/pictures.h"

#include <windows.h>

#include <optional>
#include <string>
#include <utility>

#include "platform/picture_file.h"
#include "platform/windows/drawing.h"
#include "platform/windows/gif.h"
#include "platform/windows/resource.h"
#include "platform/windows/wic.h"

namespace platform {
namespace {

std::optional<Pixels> Decode(std::string_view content) {
  const std::optional<PictureFile> file = ReadPictureFile(content);
  if (!file) return std::nullopt;
  if (file->Format == PictureFormat::Gif) return DecodeGif(content);
  if (file->Length <= content.size()) return DecodeWithWic(content);
  std::string filled(content);  // a bitmap without the last bytes that fill up its row
  filled.resize(file->Length);
  return DecodeWithWic(filled);
}

}  // namespace

Picture LoadPicture(std::string_view content) {
  try {
    std::optional<Pixels> pixels = Decode(content);
    if (pixels) return Picture(std::make_shared<const PictureData>(std::move(*pixels)));
  } catch (const std::exception&) {  // not enough memory
  }
  return {};
}

Picture LoadPictureResource(int id) { return LoadPicture(Resource(id, "GIF")); }

}  // namespace platform

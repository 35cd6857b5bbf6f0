#include "platform/pictures.h"

#include <windows.h>

#include <optional>
#include <utility>

#include "platform/windows/drawing.h"
#include "platform/windows/gif.h"
#include "platform/windows/resource.h"
#include "platform/windows/whole_file.h"
#include "platform/windows/wic.h"

namespace platform {
namespace {

std::optional<Pixels> Decode(std::string_view content) {
  if (content.starts_with("GIF8")) return DecodeGif(content);
  if (content.starts_with("BM") && BmpIsWhole(content)) return DecodeWithWic(content);
  if (content.starts_with("\xFF\xD8\xFF") && JpegIsWhole(content)) return DecodeWithWic(content);
  return std::nullopt;
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

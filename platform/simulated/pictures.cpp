// No pixel is made of a picture: none is refused once it is loaded.
#include "platform/pictures.h"

#include <algorithm>
#include <iterator>
#include <memory>
#include <string>
#include <utility>

#include "platform/picture_file.h"
#include "platform/simulated/machine.h"
#include "platform/simulated/pictures.h"
#include "resources/ids.h"

namespace platform {

Picture LoadPicture(std::string content) {
  if (simulated::Fails() || !ReadPictureFile(content)) return {};
  return Picture(std::make_shared<const PictureData>(PictureData{0, std::move(content)}));
}

Picture LoadPictureResource(int id) {
  constexpr int pictures[] = {FIGURA_PREVIA, FIGURA_CONTROLE, FIGURA_EXCLUIR};
  if (std::find(std::begin(pictures), std::end(pictures), id) == std::end(pictures)) return {};
  return Picture(std::make_shared<const PictureData>(PictureData{id, ""}));
}

}  // namespace platform

namespace platform::simulated {

int ResourceOf(const Picture& picture) { return picture ? picture.Data()->Resource : 0; }

std::string ContentOf(const Picture& picture) { return picture ? picture.Data()->Content : ""; }

}  // namespace platform::simulated

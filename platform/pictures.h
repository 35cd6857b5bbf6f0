// Still pictures: GIF, BMP, JPEG and PNG, told apart by their content.
#pragma once

#include <memory>
#include <string_view>

namespace platform {

struct PictureData;  // of the implementation

// A picture that can be shown, or none. Copies share the pixels, which never change.
class Picture {
 public:
  Picture() = default;
  explicit Picture(std::shared_ptr<const PictureData> data) : data_(std::move(data)) {}

  // False: no picture.
  explicit operator bool() const { return data_ != nullptr; }
  bool operator==(const Picture&) const = default;  // the same pixels, not merely alike

  const PictureData* Data() const { return data_.get(); }

 private:
  std::shared_ptr<const PictureData> data_;
};

// The first frame of a picture file's content; none when it is damaged, of another format, or has more than
// 64 million pixels.
Picture LoadPicture(std::string_view content);

// A picture of the program's own resources (a number of resources/ids.h).
Picture LoadPictureResource(int id);

}  // namespace platform

// Still pictures: GIF, BMP, JPEG and PNG, told apart by their content.
#pragma once

#include <memory>
#include <string>

namespace platform {

struct PictureData;  // of the implementation

// A picture that can be shown, or none. Copies share what it is made of, which never changes.
class Picture {
 public:
  Picture() = default;
  explicit Picture(std::shared_ptr<const PictureData> data) : data_(std::move(data)) {}

  // False: no picture.
  explicit operator bool() const { return data_ != nullptr; }
  bool operator==(const Picture&) const = default;  // the same one, not merely alike

  const PictureData* Data() const { return data_.get(); }

 private:
  std::shared_ptr<const PictureData> data_;
};

// The first frame of a picture file's content; none when the file is cut, of another format, or says sizes that cannot
// be or are too large (picture_file.h). It is not decoded before it is drawn, and only then a decoder can refuse it.
Picture LoadPicture(std::string content);

// A picture of the program's own resources (a number of resources/ids.h).
Picture LoadPictureResource(int id);

}  // namespace platform

#include "platform/windows/gif.h"

#include <array>
#include <cstddef>
#include <string>

#include "platform/picture_file.h"

namespace platform {
namespace {

constexpr std::uint32_t White = 0xFFFFFF;
constexpr int MostCodes = 4096;
constexpr int WidestCode = 12;  // bits
constexpr int ImageBlock = 0x2C, ExtensionBlock = 0x21, GraphicControl = 0xF9;

// The file's bytes in order. Reading past the end gives zeros and is remembered.
class Reader {
 public:
  explicit Reader(std::string_view content) : rest_(content) {}

  int Byte() {
    const std::string_view byte = Take(1);
    return byte.empty() ? 0 : static_cast<unsigned char>(byte[0]);
  }

  int Word() {
    const int low = Byte();
    return low | Byte() << 8;
  }

  std::string_view Take(std::size_t length) {
    if (length > rest_.size()) {
      short_ = true;
      rest_ = {};
    }
    const std::string_view taken = rest_.substr(0, length);
    rest_.remove_prefix(taken.size());
    return taken;
  }

  // Pieces of up to 255 bytes, each behind its length, up to the empty one.
  std::string Pieces() {
    std::string all;
    while (const int length = Byte()) all += Take(static_cast<std::size_t>(length));
    return all;
  }

  bool Whole() const { return !short_; }

 private:
  std::string_view rest_;
  bool short_ = false;
};

// Codes of growing width, the lowest bits first.
class Codes {
 public:
  explicit Codes(std::string_view data) : data_(data) {}

  int Next(int width) {  // -1: no more
    for (; held_ < width; held_ += 8) {
      if (position_ == data_.size()) return -1;
      bits_ |= static_cast<std::uint32_t>(static_cast<unsigned char>(data_[position_++])) << held_;
    }
    const int code = static_cast<int>(bits_ & ((1U << width) - 1));
    bits_ >>= width;
    held_ -= width;
    return code;
  }

 private:
  std::string_view data_;
  std::size_t position_ = 0;
  std::uint32_t bits_ = 0;
  int held_ = 0;
};

// The strings that the codes stand for: each is an earlier one and one index more.
class Dictionary {
 public:
  explicit Dictionary(int indexBits) : clear_(1 << indexBits) {
    for (int i = 0; i < clear_; ++i) At(i) = {0, 1, static_cast<std::uint8_t>(i), static_cast<std::uint8_t>(i)};
    Reset();
  }

  int Clear() const { return clear_; }
  int End() const { return clear_ + 1; }
  int Next() const { return next_; }
  int Width() const { return width_; }

  void Reset() {
    next_ = clear_ + 2;
    width_ = 1;
    while (1 << width_ < next_) ++width_;
  }

  // Once all codes are given away, the dictionary stays as it is.
  void Add(int previous, int firstOf) {
    if (next_ == MostCodes) return;
    const Entry& earlier = At(previous);
    At(next_) = {static_cast<std::uint16_t>(previous), static_cast<std::uint16_t>(earlier.Length + 1), earlier.First,
                 At(firstOf).First};
    if (++next_ == 1 << width_ && width_ < WidestCode) ++width_;
  }

  // Writes the string, cut at the end of `indices`; how many were written.
  std::size_t Write(int code, std::vector<std::uint8_t>& indices, std::size_t position) const {
    const std::size_t length = At(code).Length;
    for (std::size_t i = length; i-- > 0; code = At(code).Earlier) {
      if (position + i < indices.size()) indices[position + i] = At(code).Last;
    }
    return length;
  }

 private:
  struct Entry {
    std::uint16_t Earlier, Length;
    std::uint8_t First, Last;
  };
  Entry& At(int code) { return entries_[static_cast<std::size_t>(code)]; }
  const Entry& At(int code) const { return entries_[static_cast<std::size_t>(code)]; }

  int clear_, next_ = 0, width_ = 0;
  std::array<Entry, MostCodes> entries_{};
};

// Fills all of `indices`, or answers false.
bool Expand(std::string_view data, int indexBits, std::vector<std::uint8_t>& indices) {
  Dictionary dictionary(indexBits);
  Codes codes(data);
  int previous = -1;
  for (std::size_t position = 0; position < indices.size();) {
    const int code = codes.Next(dictionary.Width());
    if (code == dictionary.Clear()) {
      dictionary.Reset();
      previous = -1;
      continue;
    }
    if (code < 0 || code == dictionary.End() || code > dictionary.Next()) return false;
    if (previous < 0) {
      if (code > dictionary.Clear()) return false;
    } else {
      dictionary.Add(previous, code == dictionary.Next() ? previous : code);
    }
    position += dictionary.Write(code, indices, position);
    previous = code;
  }
  return true;
}

struct Image {
  int Width, Height, IndexBits;
  bool Interlaced;
  std::string_view Table;  // three bytes a colour
  std::string Data;
};

std::string_view ColourTable(Reader& reader, int flags) {
  return (flags & 0x80) != 0 ? reader.Take(std::size_t{3} << ((flags & 7) + 1)) : std::string_view();
}

Image ReadImage(Reader& reader, std::string_view globalTable) {
  reader.Take(4);  // its place on the screen
  Image image{};
  image.Width = reader.Word();
  image.Height = reader.Word();
  const int flags = reader.Byte();
  image.Interlaced = (flags & 0x40) != 0;
  image.Table = (flags & 0x80) != 0 ? ColourTable(reader, flags) : globalTable;
  image.IndexBits = reader.Byte();
  image.Data = reader.Pieces();
  return image;
}

// Order in which the rows are stored.
std::vector<int> RowOrder(const Image& image) {
  struct Pass {
    int First, Step;
  };
  static constexpr Pass Plain[] = {{0, 1}}, Woven[] = {{0, 8}, {4, 8}, {2, 4}, {1, 2}};
  std::vector<int> rows;
  const auto add = [&](Pass pass) {
    for (int row = pass.First; row < image.Height; row += pass.Step) rows.push_back(row);
  };
  if (image.Interlaced) {
    for (const Pass& pass : Woven) add(pass);
  } else {
    add(Plain[0]);
  }
  return rows;
}

// A code takes two bits or more and stands for less than MostCodes pixels.
bool Plausible(const Image& image) {
  const std::int64_t pixels = std::int64_t{image.Width} * image.Height;
  return pixels > 0 && pixels <= MostPixels && image.IndexBits >= 1 && image.IndexBits <= 8 &&
         pixels <= static_cast<std::int64_t>(image.Data.size()) * 4 * MostCodes;
}

std::optional<Pixels> Paint(const Image& image, int transparent) {
  if (!Plausible(image)) return std::nullopt;
  const auto width = static_cast<std::size_t>(image.Width);
  std::vector<std::uint8_t> indices(width * static_cast<std::size_t>(image.Height));
  if (!Expand(image.Data, image.IndexBits, indices)) return std::nullopt;

  Pixels pixels{image.Width, image.Height, std::vector<std::uint32_t>(indices.size(), White)};
  const auto channel = [&](std::size_t at) { return std::uint32_t{static_cast<unsigned char>(image.Table[at])}; };
  std::size_t from = 0;
  for (const int row : RowOrder(image)) {
    std::uint32_t* to = &pixels.Colours[static_cast<std::size_t>(row) * width];
    for (std::size_t column = 0; column < width; ++column, ++from) {
      const std::size_t index = indices[from];
      if (static_cast<int>(index) == transparent) continue;
      if (3 * index >= image.Table.size()) return std::nullopt;
      to[column] = channel(3 * index) << 16 | channel(3 * index + 1) << 8 | channel(3 * index + 2);
    }
  }
  return pixels;
}

}  // namespace

std::optional<Pixels> DecodeGif(std::string_view content) {
  Reader reader(content);
  if (reader.Take(4) != "GIF8") return std::nullopt;
  reader.Take(6);  // the version's rest and the size of the screen
  const int flags = reader.Byte();
  reader.Take(2);
  const std::string_view table = ColourTable(reader, flags);

  int transparent = -1;
  for (int block = reader.Byte(); block == ExtensionBlock || block == ImageBlock; block = reader.Byte()) {
    if (block == ImageBlock) {
      const Image image = ReadImage(reader, table);
      return reader.Whole() ? Paint(image, transparent) : std::nullopt;
    }
    const bool control = reader.Byte() == GraphicControl;
    const std::string data = reader.Pieces();
    if (!control || data.size() < 4) continue;
    transparent = (data[0] & 1) != 0 ? static_cast<unsigned char>(data[3]) : -1;
  }
  return std::nullopt;  // no image before the trailer, or before the end of a truncated file
}

}  // namespace platform

// The peer of tvk: read_games read|deflate DIRECTORY reads each file of a directory, one after the other, by the same
// calls of the platform, and deflates it as tvk does, into memory.
#include <zlib.h>

#include <algorithm>
#include <string>
#include <string_view>

#include "platform/files.h"

namespace {

// Makes the file the buffer's beginning, which only grows.
bool ReadAll(const std::string& path, std::string& buffer, std::size_t& length) {
  platform::File file(path, platform::Access::Read);
  if (file.Size() < 0) return false;
  length = static_cast<std::size_t>(file.Size());
  buffer.resize(std::max(buffer.size(), length));
  return file.Read(0, buffer.data(), length) == static_cast<std::int64_t>(length);
}

bool Deflate(std::string& content, std::size_t length, std::string& deflated) {
  z_stream stream{};
  if (deflateInit2(&stream, 9, Z_DEFLATED, -MAX_WBITS, MAX_MEM_LEVEL, Z_DEFAULT_STRATEGY) != Z_OK) return false;
  deflated.resize(std::max<std::size_t>(deflated.size(), deflateBound(&stream, static_cast<uLong>(length))));
  stream.next_in = reinterpret_cast<Bytef*>(content.data());
  stream.avail_in = static_cast<uInt>(length);
  stream.next_out = reinterpret_cast<Bytef*>(deflated.data());
  stream.avail_out = static_cast<uInt>(deflated.size());
  const bool done = deflate(&stream, Z_FINISH) == Z_STREAM_END;
  deflateEnd(&stream);
  return done;
}

}  // namespace

int main(int count, char** arguments) {
  if (count != 3) return 2;
  const bool deflated = std::string_view(arguments[1]) == "deflate";
  const std::string directory = std::string(arguments[2]) + "\\";
  std::string content, result;
  const auto files = platform::ListDirectory(directory, "*");
  for (const platform::DirectoryEntry& each : files) {
    std::size_t length = 0;
    if (!ReadAll(directory + each.Name, content, length)) return 1;
    if (deflated && !Deflate(content, length, result)) return 1;
  }
  return files.empty() ? 1 : 0;
}

// How paths are handed to Windows.
#pragma once

#include <string>

namespace platform {

// The path as Windows takes it; every path of platform/files.h passes through here. A path with a NUL in it, which
// Windows would read as another, shorter one, becomes the empty text, which names nothing. From the first call on,
// a drive without a disk is an error like any other and no box asks for one.
const char* WindowsPath(const std::string& path);

}  // namespace platform

#include "platform/console.h"

// clang-format off
#include <windows.h>
#include <shellapi.h>
// clang-format on

#include <algorithm>
#include <memory>

#include "platform/text.h"
#include "platform/windows/wide.h"

namespace platform {
namespace {

struct LocalFreer {
  void operator()(LPWSTR* memory) const { ::LocalFree(memory); }
};

// Null where the program has no such stream.
HANDLE HandleOf(Stream stream) {
  const HANDLE handle = ::GetStdHandle(stream == Stream::Output ? STD_OUTPUT_HANDLE : STD_ERROR_HANDLE);
  return handle == INVALID_HANDLE_VALUE ? nullptr : handle;
}

// Half a character, at the end of a piece, would not be shown.
std::size_t PieceLength(std::wstring_view text) {
  constexpr std::size_t most = 8192;  // a console takes no more than 64 KiB at once
  if (text.size() <= most) return text.size();
  return IS_HIGH_SURROGATE(text[most - 1]) ? most - 1 : most;
}

bool WriteToConsole(HANDLE console, std::wstring_view text) {
  while (!text.empty()) {
    const auto length = static_cast<DWORD>(PieceLength(text));
    DWORD written = 0;
    if (!::WriteConsoleW(console, text.data(), length, &written, nullptr) || written == 0) return false;
    text.remove_prefix(written);
  }
  return true;
}

bool WriteToFile(HANDLE file, std::string_view bytes) {
  constexpr std::size_t most = std::size_t{1} << 30;
  while (!bytes.empty()) {
    const auto length = static_cast<DWORD>(std::min(bytes.size(), most));
    DWORD written = 0;
    if (!::WriteFile(file, bytes.data(), length, &written, nullptr) || written == 0) return false;
    bytes.remove_prefix(written);
  }
  return true;
}

}  // namespace

std::vector<Argument> CommandLineArguments() {
  int count = 0;
  const std::unique_ptr<LPWSTR, LocalFreer> parts(::CommandLineToArgvW(::GetCommandLineW(), &count));
  std::vector<Argument> arguments;
  for (int i = 1; parts && i < count; ++i) {
    std::string utf8 = Utf8Of(parts.get()[i]);
    std::optional<std::string> ansi = FromUtf8Exactly(utf8);
    arguments.push_back({std::move(utf8), std::move(ansi)});
  }
  return arguments;
}

bool IsConsole(Stream stream) {
  DWORD mode = 0;
  return ::GetConsoleMode(HandleOf(stream), &mode) != 0;
}

bool WriteStream(Stream stream, std::string_view utf8) {
  const HANDLE handle = HandleOf(stream);
  if (handle == nullptr) return true;
  return IsConsole(stream) ? WriteToConsole(handle, Decode(CP_UTF8, 0, utf8)) : WriteToFile(handle, utf8);
}

std::uint64_t GetTickCount64() { return ::GetTickCount64(); }

}  // namespace platform

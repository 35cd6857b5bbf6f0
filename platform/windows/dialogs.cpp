// clang-format off
#include <windows.h>
#include <commdlg.h>
// clang-format on

#include <algorithm>

#include "platform/messages.h"
#include "platform/text.h"
#include "platform/windows/events.h"
#include "platform/windows/system_library.h"
#include "platform/windows/window.h"

namespace platform {
namespace {

// The dialogs take the program's current directory with them; the program keeps its own.
class KeptDirectory {
 public:
  KeptDirectory() : known_(::GetCurrentDirectoryA(sizeof path_, path_) != 0) {}
  ~KeptDirectory() {
    if (known_) ::SetCurrentDirectoryA(path_);
  }
  KeptDirectory(const KeptDirectory&) = delete;
  KeptDirectory& operator=(const KeptDirectory&) = delete;

 private:
  char path_[4096] = "";
  bool known_;
};

const char* OrNull(const std::string& text) { return text.empty() ? nullptr : text.c_str(); }

// The file buffer as it is first shown: as much of the name as leaves room for the closing zero. Blanks behind a name
// are no part of it; Wine's dialog would take them into the path, and ends the program when that becomes too long.
std::string FileBuffer(const OpenFileName& request) {
  std::string buffer(WholeCharacters(request.File, request.FileSize - 1));
  buffer.resize(buffer.find_last_not_of(' ') + 1);
  buffer.resize(request.FileSize, '\0');
  return buffer;
}

bool Ask(const char* function, OpenFileName& request) {
  const auto dialog = SystemFunction<BOOL WINAPI(LPOPENFILENAMEA)>("comdlg32.dll", function);
  if (dialog == nullptr || request.FileSize == 0) return false;
  std::string file = FileBuffer(request);
  OPENFILENAMEA native{};
  native.lStructSize = sizeof native;
  native.hwndOwner = request.Owner != nullptr ? request.Owner->State().Handle : nullptr;
  native.hInstance = ::GetModuleHandleA(nullptr);
  native.lpstrFilter = OrNull(request.Filter);
  native.lpstrFile = file.data();
  native.nMaxFile = static_cast<DWORD>(file.size());
  native.lpstrInitialDir = OrNull(request.InitialDirectory);
  native.lpstrTitle = OrNull(request.Title);
  native.Flags = request.Flags;
  native.lpstrDefExt = OrNull(request.DefaultExtension);
  const KeptDirectory directory;
  const OwnEventLoop loop;
  if (!dialog(&native)) return false;
  request.File = file.substr(0, std::min(file.find('\0'), file.size()));
  return true;
}

}  // namespace

bool GetOpenFileNameA(OpenFileName& request) { return Ask("GetOpenFileNameA", request); }

bool GetSaveFileNameA(OpenFileName& request) { return Ask("GetSaveFileNameA", request); }

}  // namespace platform

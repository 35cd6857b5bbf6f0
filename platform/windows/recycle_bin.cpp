// Deleting what the person may want back.
// clang-format off
#include <windows.h>
#include <initguid.h>
#include <shellapi.h>
#include <shobjidl.h>
// clang-format on

#include <memory>

#include "platform/files.h"
#include "platform/windows/com.h"
#include "platform/windows/events.h"
#include "platform/windows/paths.h"
#include "platform/windows/system_library.h"
#include "platform/windows/wide.h"

namespace platform {
namespace {

// The shell would also take a read-only file.
bool MayBeDeleted(const std::string& path) {
  const DWORD attributes = ::GetFileAttributesA(WindowsPath(path));
  constexpr DWORD stays = FILE_ATTRIBUTE_READONLY | FILE_ATTRIBUTE_DIRECTORY;
  if (attributes == INVALID_FILE_ATTRIBUTES || (attributes & stays) != 0) return false;
  constexpr DWORD all = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;
  const HANDLE file = ::CreateFileA(WindowsPath(path), DELETE, all, nullptr, OPEN_EXISTING, 0, nullptr);
  if (file == INVALID_HANDLE_VALUE) return false;
  ::CloseHandle(file);
  return true;
}

std::wstring FullPath(const std::string& path) {
  const std::wstring wide = ToWide(WindowsPath(path));
  std::wstring full(::GetFullPathNameW(wide.c_str(), 0, nullptr, nullptr), L'\0');
  full.resize(::GetFullPathNameW(wide.c_str(), static_cast<DWORD>(full.size()), full.data(), nullptr));
  return full;
}

struct Releaser {
  void operator()(IUnknown* object) const { object->Release(); }
};

IShellItem* ItemOf(const std::string& path) {
  const auto create =
      SystemFunction<HRESULT WINAPI(PCWSTR, IBindCtx*, REFIID, void**)>("shell32.dll", "SHCreateItemFromParsingName");
  void* item = nullptr;
  if (create == nullptr || FAILED(create(FullPath(path).c_str(), nullptr, IID_IShellItem, &item))) return nullptr;
  return static_cast<IShellItem*>(item);
}

}  // namespace

// No flag asks for the bin alone: Windows 7 knows none such. On a disk without one the file is deleted for good.
bool MoveToRecycleBin(const std::string& path) {
  if (!MayBeDeleted(path)) return false;
  const std::unique_ptr<IFileOperation, Releaser> operation(
      static_cast<IFileOperation*>(CreateObject(CLSID_FileOperation, IID_IFileOperation)));
  const std::unique_ptr<IShellItem, Releaser> item(operation ? ItemOf(path) : nullptr);
  if (!item || FAILED(operation->SetOperationFlags(FOF_ALLOWUNDO | FOF_NO_UI | FOFX_EARLYFAILURE)) ||
      FAILED(operation->DeleteItem(item.get(), nullptr))) {
    return false;
  }
  const OwnEventLoop loop;  // of the shell's
  operation->PerformOperations();
  return ::GetFileAttributesA(WindowsPath(path)) == INVALID_FILE_ATTRIBUTES;
}

}  // namespace platform

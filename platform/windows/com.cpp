#include "platform/windows/com.h"

#include <objbase.h>

#include "platform/windows/system_library.h"

namespace platform {

bool PrepareCom() {
  static const bool prepared = [] {
    const auto initialize = SystemFunction<HRESULT WINAPI(LPVOID, DWORD)>("ole32.dll", "CoInitializeEx");
    return initialize != nullptr && SUCCEEDED(initialize(nullptr, COINIT_APARTMENTTHREADED | COINIT_DISABLE_OLE1DDE));
  }();
  return prepared;
}

void* CreateObject(REFCLSID classId, REFIID interfaceId) {
  const auto create =
      SystemFunction<HRESULT WINAPI(REFCLSID, LPUNKNOWN, DWORD, REFIID, LPVOID*)>("ole32.dll", "CoCreateInstance");
  void* made = nullptr;
  if (!PrepareCom() || create == nullptr) return nullptr;
  return SUCCEEDED(create(classId, nullptr, CLSCTX_INPROC_SERVER, interfaceId, &made)) ? made : nullptr;
}

}  // namespace platform

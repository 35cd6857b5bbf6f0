// Functions of Windows' own libraries that are looked up when they are needed.
#pragma once

#include <windows.h>

namespace platform {

// The library of the system's directory, wherever else one of that name lies; null when it cannot be loaded. It then
// stays loaded. A library that the manifest asks for in a newer version is not for this.
HMODULE SystemLibrary(const char* library);

// The function of such a library, or null.
// F is the function's type: SystemFunction<BOOL WINAPI(LPOPENFILENAMEA)>("comdlg32.dll", "GetOpenFileNameA").
template <typename F>
F* SystemFunction(const char* library, const char* name) {
  const HMODULE module = SystemLibrary(library);
  if (module == nullptr) return nullptr;
  return reinterpret_cast<F*>(reinterpret_cast<void*>(::GetProcAddress(module, name)));
}

}  // namespace platform

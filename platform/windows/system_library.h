// Functions of Windows' own libraries that are looked up when they are needed.
#pragma once

#include <windows.h>

namespace platform {

// The function of a library in the system's directory, or null. The library then stays loaded.
// F is the function's type: SystemFunction<BOOL WINAPI(LPOPENFILENAMEA)>("comdlg32.dll", "GetOpenFileNameA").
template <typename F>
F* SystemFunction(const char* library, const char* name) {
  const HMODULE module = ::LoadLibraryExA(library, nullptr, LOAD_LIBRARY_SEARCH_SYSTEM32);
  if (module == nullptr) return nullptr;
  return reinterpret_cast<F*>(reinterpret_cast<void*>(::GetProcAddress(module, name)));
}

}  // namespace platform

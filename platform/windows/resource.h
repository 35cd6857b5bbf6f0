// What the program file carries.
#pragma once

#include <windows.h>

#include <string_view>

namespace platform {

// A resource of the program; empty when there is none. It stays where it is for as long as the program runs.
inline std::string_view Resource(int id, LPCSTR type) {
  const HRSRC found = ::FindResourceA(nullptr, MAKEINTRESOURCEA(id), type);
  const HGLOBAL loaded = found != nullptr ? ::LoadResource(nullptr, found) : nullptr;
  if (loaded == nullptr) return {};
  return {static_cast<const char*>(::LockResource(loaded)), ::SizeofResource(nullptr, found)};
}

}  // namespace platform

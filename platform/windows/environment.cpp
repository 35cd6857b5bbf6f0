#include "platform/environment.h"

#include <windows.h>

namespace platform {

// With too little room the answer is the room that it takes, the closing zero included; else the length without it.
std::string GetEnvironmentVariableA(const std::string& name) {
  std::string value(MAX_PATH, '\0');
  for (;;) {
    const DWORD length = ::GetEnvironmentVariableA(name.c_str(), value.data(), static_cast<DWORD>(value.size()));
    const bool fits = length < value.size();
    value.resize(length);
    if (fits) return value;
  }
}

}  // namespace platform

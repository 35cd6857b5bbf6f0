// The registry. Results are the platform's: 0 is success, anything else the error's number.
#pragma once

#include <cstdint>
#include <string>

namespace platform {

using RegistryKey = std::intptr_t;  // 0: none

inline constexpr std::uint32_t RootCurrentUser = 0x80000001;  // HKEY_CURRENT_USER

inline constexpr std::uint32_t KeyQueryAndSet = 3;  // KEY_QUERY_VALUE | KEY_SET_VALUE

inline constexpr std::uint32_t RegistryText = 1;    // REG_SZ
inline constexpr std::uint32_t RegistryBinary = 3;  // REG_BINARY
inline constexpr std::uint32_t RegistryNumber = 4;  // REG_DWORD

// The handle that stands for a predefined root key.
RegistryKey RootKey(std::uint32_t predefinedKey);

long RegConnectRegistryA(const std::string& computerName, RegistryKey root, RegistryKey& result);

// An empty subkey text gives a handle to the parent itself. `result` is only set on success.
long RegOpenKeyExA(RegistryKey parent, const std::string& subkey, std::uint32_t access, RegistryKey& result);

// Opens the key when it exists. A backslash at the end of `subkey` is ignored.
long RegCreateKeyA(RegistryKey parent, const std::string& subkey, RegistryKey& result);

// `size`: the room in `data` in bytes before, the length of the value's data afterwards (a text's closing zero
// included, when it was stored). Fails when the data is longer than the room.
long RegQueryValueExA(RegistryKey key, const std::string& valueName, std::uint32_t& type, void* data,
                      std::uint32_t& size);

long RegSetValueExA(RegistryKey key, const std::string& valueName, std::uint32_t type, const void* data,
                    std::uint32_t size);

// Fails when the key has keys below it.
long RegDeleteKeyA(RegistryKey parent, const std::string& subkey);

long RegCloseKey(RegistryKey key);

}  // namespace platform

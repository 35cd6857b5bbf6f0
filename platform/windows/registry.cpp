#include "platform/registry.h"

#include <windows.h>

namespace platform {
namespace {

HKEY Key(RegistryKey key) { return reinterpret_cast<HKEY>(key); }

}  // namespace

RegistryKey RootKey(std::uint32_t predefinedKey) {
  return static_cast<std::int32_t>(predefinedKey);  // on 64-bit Windows the upper half repeats the sign
}

long RegConnectRegistryA(const std::string& computerName, RegistryKey root, RegistryKey& result) {
  HKEY key = nullptr;
  const long error = ::RegConnectRegistryA(computerName.c_str(), Key(root), &key);
  if (error == ERROR_SUCCESS) result = reinterpret_cast<RegistryKey>(key);
  return error;
}

long RegOpenKeyExA(RegistryKey parent, const std::string& subkey, std::uint32_t access, RegistryKey& result) {
  HKEY key = nullptr;
  const long error = ::RegOpenKeyExA(Key(parent), subkey.c_str(), 0, access, &key);
  if (error == ERROR_SUCCESS) result = reinterpret_cast<RegistryKey>(key);
  return error;
}

long RegCreateKeyA(RegistryKey parent, const std::string& subkey, RegistryKey& result) {
  HKEY key = nullptr;
  const long error = ::RegCreateKeyA(Key(parent), subkey.c_str(), &key);
  if (error == ERROR_SUCCESS) result = reinterpret_cast<RegistryKey>(key);
  return error;
}

long RegQueryValueExA(RegistryKey key, const std::string& valueName, std::uint32_t& type, void* data,
                      std::uint32_t& size) {
  DWORD valueType = type, length = size;
  const long error =
      ::RegQueryValueExA(Key(key), valueName.c_str(), nullptr, &valueType, static_cast<BYTE*>(data), &length);
  type = valueType;
  size = length;
  return error;
}

long RegSetValueExA(RegistryKey key, const std::string& valueName, std::uint32_t type, const void* data,
                    std::uint32_t size) {
  return ::RegSetValueExA(Key(key), valueName.c_str(), 0, type, static_cast<const BYTE*>(data), size);
}

long RegDeleteKeyA(RegistryKey parent, const std::string& subkey) {
  return ::RegDeleteKeyA(Key(parent), subkey.c_str());
}

long RegCloseKey(RegistryKey key) { return ::RegCloseKey(Key(key)); }

}  // namespace platform

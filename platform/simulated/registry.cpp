#include "platform/registry.h"

#include <algorithm>
#include <cstring>
#include <string_view>
#include <utility>

#include "platform/simulated/machine.h"
#include "platform/text.h"

namespace platform {
namespace {

using simulated::Fails;
using simulated::RegistryHandle;
using simulated::RegistryRecord;
using simulated::TheMachine;

// Results, by the platform's numbers.
constexpr long Success = 0, NotFound = 2, AccessDenied = 5, InvalidHandle = 6, NoSuchComputer = 53, BadPath = 161,
               MoreData = 234, InputOutputFailed = 1016, KeyDeleted = 1018;

constexpr std::uint32_t MayQuery = 1, MaySet = 2, FullAccess = 0xF003F;
constexpr std::string_view ComputerName = "SIMULADO";

const RegistryHandle* OpenedKey(RegistryKey key) {
  static const RegistryHandle root{"", FullAccess};
  if (key == RootKey(RootCurrentUser)) return &root;
  const auto found = TheMachine().RegistryHandles.find(key);
  return found == TheMachine().RegistryHandles.end() ? nullptr : &found->second;
}

bool Stands(const std::string& path) { return path.empty() || TheMachine().Registry.contains(path); }

RegistryKey NewHandle(const std::string& path, std::uint32_t access) {
  const RegistryKey key = ++TheMachine().LastHandle;
  TheMachine().RegistryHandles[key] = {path, access};
  return key;
}

// What can be said before an operation looks at the key itself.
long CheckHandle(RegistryKey key, std::uint32_t access) {
  if (Fails()) return InputOutputFailed;
  const RegistryHandle* handle = OpenedKey(key);
  if (!handle) return InvalidHandle;
  if (!Stands(handle->Path)) return KeyDeleted;
  return (handle->Access & access) == access ? Success : AccessDenied;
}

// The path of a subkey in upper case, without a backslash at its end.
std::string Below(const std::string& parent, const std::string& subkey) {
  std::string path = parent.empty() || subkey.empty() ? parent + subkey : parent + "\\" + subkey;
  path.erase(path.find_last_not_of('\\') + 1);
  return CharUpperBuffA(path);
}

// Creates the key and those above it, as their names are written.
void CreateKeys(const std::string& parent, const std::string& subkey) {
  const auto above = TheMachine().Registry.find(parent);
  std::string written = above == TheMachine().Registry.end() ? "" : above->second.Name + "\\";
  for (std::size_t start = 0; start < subkey.size();) {
    const std::size_t end = std::min(subkey.find('\\', start), subkey.size());
    if (end > start) {
      written += subkey.substr(start, end - start);
      TheMachine().Registry.try_emplace(CharUpperBuffA(written), RegistryRecord{written, {}});
      written += '\\';
    }
    start = end + 1;
  }
}

bool IsText(std::uint32_t type) { return type == RegistryText || type == 2 || type == 7; }

// Hands the data over. A text stored without its zero gets one where there is room.
long Deliver(const simulated::RegistryValue& value, void* data, std::uint32_t& size) {
  const auto length = static_cast<std::uint32_t>(value.Data.size());
  const std::uint32_t room = std::exchange(size, length);
  if (data == nullptr) return Success;
  if (length > room) return MoreData;
  std::memcpy(data, value.Data.data(), length);
  const bool open = IsText(value.Type) && (length == 0 || value.Data.back() != '\0');
  if (open && room > length) static_cast<char*>(data)[length] = '\0';
  return Success;
}

}  // namespace

RegistryKey RootKey(std::uint32_t predefinedKey) { return static_cast<RegistryKey>(predefinedKey); }

long RegConnectRegistryA(const std::string& computerName, RegistryKey root, RegistryKey& result) {
  if (const long error = CheckHandle(root, 0)) return error;
  const std::string name = CharUpperBuffA(computerName.substr(computerName.starts_with("\\\\") ? 2 : 0));
  if (!computerName.empty() && name != ComputerName) return NoSuchComputer;
  result = NewHandle(OpenedKey(root)->Path, FullAccess);
  return Success;
}

long RegOpenKeyExA(RegistryKey parent, const std::string& subkey, std::uint32_t access, RegistryKey& result) {
  if (const long error = CheckHandle(parent, 0)) return error;
  if (subkey.starts_with('\\')) return BadPath;
  const std::string path = Below(OpenedKey(parent)->Path, subkey);
  if (!Stands(path)) return NotFound;
  if (TheMachine().DeniedKeys.contains(path)) return AccessDenied;
  result = NewHandle(path, access);
  return Success;
}

long RegCreateKeyA(RegistryKey parent, const std::string& subkey, RegistryKey& result) {
  if (const long error = CheckHandle(parent, 0)) return error;
  if (subkey.starts_with('\\')) return BadPath;
  const std::string above = OpenedKey(parent)->Path, path = Below(above, subkey);
  if (TheMachine().DeniedKeys.contains(path)) return AccessDenied;
  CreateKeys(above, subkey);
  result = NewHandle(path, FullAccess);
  return Success;
}

long RegQueryValueExA(RegistryKey key, const std::string& valueName, std::uint32_t& type, void* data,
                      std::uint32_t& size) {
  if (const long error = CheckHandle(key, MayQuery)) return error;
  const auto record = TheMachine().Registry.find(OpenedKey(key)->Path);
  if (record == TheMachine().Registry.end()) return NotFound;
  const auto value = record->second.Values.find(CharUpperBuffA(valueName));
  if (value == record->second.Values.end()) return NotFound;
  type = value->second.Stored.Type;
  return Deliver(value->second.Stored, data, size);
}

long RegSetValueExA(RegistryKey key, const std::string& valueName, std::uint32_t type, const void* data,
                    std::uint32_t size) {
  if (const long error = CheckHandle(key, MaySet)) return error;
  RegistryRecord& record = TheMachine().Registry[OpenedKey(key)->Path];
  auto& value =
      record.Values.try_emplace(CharUpperBuffA(valueName), RegistryRecord::Value{valueName, {}}).first->second;
  value.Stored = {type, std::string(static_cast<const char*>(data), size)};
  return Success;
}

long RegDeleteKeyA(RegistryKey parent, const std::string& subkey) {
  if (const long error = CheckHandle(parent, 0)) return error;
  const std::string path = Below(OpenedKey(parent)->Path, subkey);
  auto& registry = TheMachine().Registry;
  const auto found = registry.find(path);
  if (found == registry.end()) return path.empty() ? AccessDenied : NotFound;
  const auto below = registry.lower_bound(path + "\\");
  const bool hasKeys = below != registry.end() && below->first.starts_with(path + "\\");
  if (hasKeys || TheMachine().DeniedKeys.contains(path)) return AccessDenied;
  registry.erase(found);
  return Success;
}

long RegCloseKey(RegistryKey key) {
  if (key == RootKey(RootCurrentUser)) return Success;
  return TheMachine().RegistryHandles.erase(key) == 0 ? InvalidHandle : Success;
}

}  // namespace platform

namespace platform::simulated {

void PutValue(const std::string& key, const std::string& name, std::uint32_t type, std::string_view data) {
  CreateKeys("", key);
  RegistryRecord& record = TheMachine().Registry[Below("", key)];
  record.Values[CharUpperBuffA(name)] = {name, {type, std::string(data)}};
}

void PutText(const std::string& key, const std::string& name, const std::string& text) {
  PutValue(key, name, RegistryText, text + '\0');
}

std::optional<RegistryValue> StoredValue(const std::string& key, const std::string& name) {
  const auto record = TheMachine().Registry.find(Below("", key));
  if (record == TheMachine().Registry.end()) return std::nullopt;
  const auto value = record->second.Values.find(CharUpperBuffA(name));
  if (value == record->second.Values.end()) return std::nullopt;
  return value->second.Stored;
}

std::optional<std::string> StoredText(const std::string& key, const std::string& name) {
  std::optional<RegistryValue> value = StoredValue(key, name);
  if (!value || value->Type != RegistryText) return std::nullopt;
  if (!value->Data.empty() && value->Data.back() == '\0') value->Data.pop_back();
  return value->Data;
}

std::vector<std::string> Keys() {
  std::vector<std::string> keys;
  for (const auto& [path, record] : TheMachine().Registry) keys.push_back(record.Name);
  return keys;
}

void DenyKey(const std::string& key, bool denied) {
  if (denied) {
    TheMachine().DeniedKeys.insert(Below("", key));
  } else {
    TheMachine().DeniedKeys.erase(Below("", key));
  }
}

std::size_t OpenRegistryHandles() { return TheMachine().RegistryHandles.size(); }

}  // namespace platform::simulated

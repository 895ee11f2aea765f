#include "platform/registry/StoredRegistry.h"

#include "platform/registry/RegistryPath.h"
#include "runtime/Text.h"

#include <algorithm>

namespace quendra::platform {

namespace {

/// Roots whose own keys are the system's hives: a program makes none there.
bool HoldsHives(RegistryKey key) { return key == kLocalMachine || key == kUsers; }

} // namespace

std::optional<StoredRegistry::OpenKey> StoredRegistry::Opened(RegistryKey key) const {
  if (IsRegistryRoot(key)) return OpenKey{key.Value(), kKeyAllAccess};
  const auto found = open_.find(key);
  if (found == open_.end()) return {};
  return found->second;
}

std::uint32_t StoredRegistry::Use(RegistryKey key, std::uint32_t access, KeyNumber& number) {
  const auto opened = Opened(key);
  if (!opened) return kInvalidRegistryKey;
  if ((opened->access & access) != access) return kRegistryAccessDenied;
  number = opened->number;
  // A root stands, also where it was opened once more.
  if (number >= kClassesRoot.Value() && number <= kDynData.Value()) return kRegistrySuccess;
  return store_.Check(number);
}

std::uint32_t StoredRegistry::FindPath(RegistryKey parent, const std::string& path, KeyNumber& number) {
  std::vector<std::string> names;
  std::uint32_t error = Use(parent, 0, number);
  if (error == kRegistrySuccess) error = NamesOfRegistryPath(path, names);
  for (const auto& name : names) {
    if (error != kRegistrySuccess) break;
    error = store_.Find(KeyNumber(number), name, number);
  }
  return error;
}

RegistryKey StoredRegistry::Open(KeyNumber number, std::uint32_t access) {
  // Far below the roots, and a multiple of 4 as the system's handles are; one that is still open is passed
  // over.
  do lastKey_ = (lastKey_ + 4) & 0x0FFFFFFF;
  while (lastKey_ == 0 || open_.contains(RegistryKey(lastKey_)));
  open_[RegistryKey(lastKey_)] = {number, access};
  return RegistryKey(lastKey_);
}

std::uint32_t StoredRegistry::RegCreateKeyA(RegistryKey parent, const std::string& path, RegistryKey& key) {
  KeyNumber number = 0;
  std::vector<std::string> names;
  std::uint32_t error = Use(parent, 0, number);
  if (error == kRegistrySuccess) error = NamesOfRegistryPath(path, names);
  if (error == kRegistrySuccess && HoldsHives(parent) && !names.empty()) {
    error = store_.Find(KeyNumber(number), names.front(), number);
    names.erase(names.begin());
    if (error == kKeyNotFound) error = kRegistryInvalidParameter;
  }
  if (error == kRegistrySuccess && !names.empty()) error = store_.Make(KeyNumber(number), names, number);
  if (error == kRegistrySuccess) key = Open(number, kKeyAllAccess);
  return error;
}

std::uint32_t StoredRegistry::RegOpenKeyExA(RegistryKey parent, const std::string& path, std::uint32_t access,
                                            RegistryKey& key) {
  KeyNumber number = 0;
  const std::uint32_t error = FindPath(parent, path, number);
  if (error == kRegistrySuccess) key = Open(number, access);
  return error;
}

std::uint32_t StoredRegistry::RegSetValueExA(RegistryKey key, const std::string& name, std::uint32_t type,
                                             std::span<const std::uint8_t> data) {
  KeyNumber number = 0;
  std::string valueName;
  std::uint32_t error = Use(key, kSetValue, number);
  if (error == kRegistrySuccess) error = NameOfRegistryValue(name, valueName);
  if (error != kRegistrySuccess) return error;
  return store_.Write(number, valueName, {type, {data.begin(), data.end()}});
}

std::uint32_t StoredRegistry::RegQueryValueExA(RegistryKey key, const std::string& name, std::uint32_t& type,
                                               std::span<std::uint8_t> buffer, std::uint32_t& size) {
  KeyNumber number = 0;
  std::string valueName;
  RegistryValue value;
  std::uint32_t error = Use(key, kQueryValue, number);
  if (error == kRegistrySuccess) error = NameOfRegistryValue(name, valueName);
  if (error == kRegistrySuccess) error = store_.Read(number, valueName, value);
  if (error != kRegistrySuccess) return error;
  type = value.type;
  size = static_cast<std::uint32_t>(value.data.size());
  if (buffer.data() == nullptr) return kRegistrySuccess;
  if (buffer.size() < value.data.size()) return kMoreValueData;
  std::copy(value.data.begin(), value.data.end(), buffer.begin());
  return kRegistrySuccess;
}

std::uint32_t StoredRegistry::RegCloseKey(RegistryKey key) {
  if (IsRegistryRoot(key)) return kRegistrySuccess;
  return open_.erase(key) > 0 ? kRegistrySuccess : kInvalidRegistryKey;
}

std::uint32_t StoredRegistry::RegDeleteKeyA(RegistryKey parent, const std::string& path) {
  KeyNumber number = 0;
  const std::uint32_t error = FindPath(parent, path, number);
  if (error != kRegistrySuccess) return error;
  // A root by an empty path, a hive by its name: the system keeps both.
  const std::string_view name = CutAtNul(std::string_view(path));
  if (name.empty() && IsRegistryRoot(parent)) return kRegistryAccessDenied;
  if (HoldsHives(parent) && name.find('\\') == std::string_view::npos) return kRegistryAccessDenied;
  return store_.Remove(number);
}

std::uint32_t StoredRegistry::RegDeleteValueA(RegistryKey key, const std::string& name) {
  KeyNumber number = 0;
  std::string valueName;
  std::uint32_t error = Use(key, kSetValue, number);
  if (error == kRegistrySuccess) error = NameOfRegistryValue(name, valueName);
  return error == kRegistrySuccess ? store_.Erase(number, valueName) : error;
}

std::uint32_t StoredRegistry::RegEnumKeyExA(RegistryKey key, std::uint32_t index, std::string& name) {
  KeyNumber number = 0;
  const std::uint32_t error = Use(key, kEnumerateSubKeys, number);
  return error == kRegistrySuccess ? store_.NameAt(number, index, name) : error;
}

} // namespace quendra::platform

#include "platform/simulated/registry/SimulatedRegistry.h"

#include "platform/registry/FreshKeys.h"
#include "platform/simulated/SimulatedCore.h"

#include <array>

namespace quendra::platform::simulated {

namespace {

constexpr std::array kRootNames{"HKEY_CLASSES_ROOT", "HKEY_CURRENT_USER",     "HKEY_LOCAL_MACHINE",
                                "HKEY_USERS",        "HKEY_PERFORMANCE_DATA", "HKEY_CURRENT_CONFIG",
                                "HKEY_DYN_DATA"};

std::string NameOf(RegistryKey root) {
  const std::uint32_t index = root.Value() - kClassesRoot.Value();
  return index < kRootNames.size() ? kRootNames[index] : std::to_string(root.Value());
}

/// A whole path as its root's number and the names below it.
struct WholePath {
  RegistryStore::KeyNumber root = 0;
  std::vector<std::string> names{};
};

WholePath PathOf(std::string path) {
  WholePath whole;
  for (std::size_t end = 0; end != std::string::npos && !path.empty();) {
    end = path.find('\\');
    whole.names.push_back(path.substr(0, end));
    if (end != std::string::npos) path.erase(0, end + 1);
  }
  for (std::uint32_t index = 0; index < kRootNames.size(); ++index)
    if (!whole.names.empty() && whole.names[0] == kRootNames[index])
      whole.root = kClassesRoot.Value() + index;
  if (!whole.names.empty()) whole.names.erase(whole.names.begin());
  return whole;
}

} // namespace

SimulatedRegistry::SimulatedRegistry() : StoredRegistry(tree_) {
  for (const FreshKey& key : FreshKeys()) AddKey(NameOf(key.root) + "\\" + key.path);
}

RegistryStore::KeyNumber SimulatedRegistry::NumberOf(const std::string& path) const {
  const WholePath whole = PathOf(path);
  RegistryStore::KeyNumber number = whole.root;
  for (const auto& name : whole.names)
    if (number != 0) number = tree_.Child(number, name);
  return number;
}

RegistryStore::KeyNumber SimulatedRegistry::Made(const std::string& path) {
  const WholePath whole = PathOf(path);
  RegistryStore::KeyNumber number = whole.root;
  tree_.Make(whole.root, whole.names, number);
  return number;
}

void SimulatedRegistry::AddKey(const std::string& path) { Made(path); }

void SimulatedRegistry::RemoveKey(const std::string& path) { tree_.RemoveAll(NumberOf(path)); }

void SimulatedRegistry::SetValue(const std::string& path, const std::string& name,
                                 const RegistryValue& value) {
  tree_.Write(Made(path), name, value);
}

bool SimulatedRegistry::HasKey(const std::string& path) const { return NumberOf(path) != 0; }

std::optional<RegistryValue> SimulatedRegistry::Value(const std::string& path, const std::string& name) {
  RegistryValue value;
  const auto number = NumberOf(path);
  if (number == 0 || tree_.Read(number, name, value) != kRegistrySuccess) return {};
  return value;
}

void SimulatedRegistry::Refuse(const std::string& path, std::uint32_t error) {
  tree_.Refused[Made(path)] = error;
}

void SimulatedRegistry::RefuseAll(std::uint32_t error) {
  if (error == kRegistrySuccess)
    tree_.Refused.erase(0);
  else
    tree_.Refused[0] = error;
}

std::uint32_t SimulatedRegistry::RegCreateKeyA(RegistryKey parent, const std::string& path,
                                               RegistryKey& key) {
  Calls.push_back("RegCreateKeyA " + NameOf(parent) + "\\" + CutText(path));
  return StoredRegistry::RegCreateKeyA(parent, path, key);
}

std::uint32_t SimulatedRegistry::RegOpenKeyExA(RegistryKey parent, const std::string& path,
                                               std::uint32_t access, RegistryKey& key) {
  Calls.push_back("RegOpenKeyExA " + NameOf(parent) + "\\" + CutText(path));
  return StoredRegistry::RegOpenKeyExA(parent, path, access, key);
}

std::uint32_t SimulatedRegistry::RegSetValueExA(RegistryKey key, const std::string& name, std::uint32_t type,
                                                std::span<const std::uint8_t> data) {
  Calls.push_back("RegSetValueExA " + CutText(name));
  return StoredRegistry::RegSetValueExA(key, name, type, data);
}

std::uint32_t SimulatedRegistry::RegCloseKey(RegistryKey key) {
  Calls.emplace_back("RegCloseKey");
  return StoredRegistry::RegCloseKey(key);
}

} // namespace quendra::platform::simulated

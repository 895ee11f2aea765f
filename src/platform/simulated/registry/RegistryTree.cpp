#include "platform/simulated/registry/RegistryTree.h"

#include <algorithm>

namespace quendra::platform::simulated {

namespace {

char Small(char letter) { return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter + 32) : letter; }

} // namespace

bool RegistryTree::CaseBlind::operator()(const std::string& left, const std::string& right) const {
  return std::lexicographical_compare(left.begin(), left.end(), right.begin(), right.end(),
                                      [](char one, char other) { return Small(one) < Small(other); });
}

std::uint32_t RegistryTree::WhyRefused(KeyNumber key) const {
  for (const KeyNumber asked : {KeyNumber{0}, key})
    if (const auto found = Refused.find(asked); found != Refused.end()) return found->second;
  return kRegistrySuccess;
}

RegistryTree::KeyNumber RegistryTree::Child(KeyNumber parent, const std::string& name) const {
  constexpr CaseBlind comesBefore;
  for (const auto& [number, key] : keys_)
    if (key.parent == parent && !comesBefore(key.name, name) && !comesBefore(name, key.name)) return number;
  return 0;
}

std::uint32_t RegistryTree::Find(KeyNumber parent, const std::string& name, KeyNumber& key) {
  const KeyNumber child = Child(parent, name);
  if (const auto refused = WhyRefused(child)) return refused;
  if (child == 0) return kKeyNotFound;
  key = child;
  return kRegistrySuccess;
}

std::uint32_t RegistryTree::Check(KeyNumber key) {
  if (const auto refused = WhyRefused(key)) return refused;
  return keys_.contains(key) ? kRegistrySuccess : kKeyMarkedDeleted;
}

std::uint32_t RegistryTree::Make(KeyNumber parent, const std::vector<std::string>& path, KeyNumber& key) {
  KeyNumber at = parent;
  std::size_t known = 0;
  while (true) {
    if (const auto refused = WhyRefused(at)) return refused;
    const KeyNumber child = known < path.size() ? Child(at, path[known]) : 0;
    if (child == 0) break;
    at = child;
    ++known;
  }
  for (; known < path.size(); ++known) {
    keys_[++last_] = {at, path[known], {}};
    at = last_;
  }
  key = at;
  return kRegistrySuccess;
}

std::uint32_t RegistryTree::Remove(KeyNumber key) {
  const bool hasKeys =
      std::any_of(keys_.begin(), keys_.end(), [&](const auto& entry) { return entry.second.parent == key; });
  if (hasKeys) return kRegistryAccessDenied;
  keys_.erase(key);
  return kRegistrySuccess;
}

void RegistryTree::RemoveAll(KeyNumber key) {
  std::vector<KeyNumber> below;
  for (const auto& [number, entry] : keys_)
    if (entry.parent == key) below.push_back(number);
  for (const KeyNumber number : below) RemoveAll(number);
  keys_.erase(key);
}

std::uint32_t RegistryTree::NameAt(KeyNumber parent, std::uint32_t index, std::string& name) {
  std::vector<std::string> names;
  for (const auto& [number, entry] : keys_)
    if (entry.parent == parent) names.push_back(entry.name);
  std::sort(names.begin(), names.end(), CaseBlind());
  if (index >= names.size()) return kNoMoreKeys;
  name = names[index];
  return kRegistrySuccess;
}

std::uint32_t RegistryTree::Read(KeyNumber key, const std::string& name, RegistryValue& value) {
  if (const auto refused = WhyRefused(key)) return refused;
  const auto& values = keys_[key].values;
  const auto found = values.find(name);
  if (found == values.end()) return kKeyNotFound;
  value = found->second;
  return kRegistrySuccess;
}

std::uint32_t RegistryTree::Write(KeyNumber key, const std::string& name, const RegistryValue& value) {
  if (const auto refused = WhyRefused(key)) return refused;
  keys_[key].values[name] = value;
  return kRegistrySuccess;
}

std::uint32_t RegistryTree::Erase(KeyNumber key, const std::string& name) {
  if (const auto refused = WhyRefused(key)) return refused;
  return keys_[key].values.erase(name) > 0 ? kRegistrySuccess : kKeyNotFound;
}

} // namespace quendra::platform::simulated

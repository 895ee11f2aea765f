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

bool RegistryTree::ByParentThenName::operator()(const Place& left, const Place& right) const {
  return left.parent != right.parent ? left.parent < right.parent : CaseBlind()(left.name, right.name);
}

std::uint32_t RegistryTree::WhyRefused(KeyNumber key) const {
  for (const KeyNumber asked : {KeyNumber{0}, key})
    if (const auto found = Refused.find(asked); found != Refused.end()) return found->second;
  return kRegistrySuccess;
}

RegistryTree::KeyNumber RegistryTree::Child(KeyNumber parent, const std::string& name) const {
  const auto found = places_.find({parent, name});
  return found == places_.end() ? 0 : found->second;
}

bool RegistryTree::HasKeys(KeyNumber key) const {
  const auto first = FirstBelow(key);
  return first != places_.end() && first->first.parent == key;
}

RegistryTree::KeyNumber RegistryTree::Add(KeyNumber parent, const std::string& name) {
  keys_[++last_] = {parent, name, {}};
  places_[{parent, name}] = last_;
  return last_;
}

void RegistryTree::Forget(KeyNumber key) {
  const auto found = keys_.find(key);
  if (found == keys_.end()) return;
  places_.erase({found->second.parent, found->second.name});
  keys_.erase(found);
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
  for (; known < path.size(); ++known) at = Add(at, path[known]);
  key = at;
  return kRegistrySuccess;
}

std::uint32_t RegistryTree::Remove(KeyNumber key) {
  if (HasKeys(key)) return kRegistryAccessDenied;
  Forget(key);
  return kRegistrySuccess;
}

void RegistryTree::RemoveAll(KeyNumber key) {
  while (HasKeys(key)) RemoveAll(FirstBelow(key)->second);
  Forget(key);
}

std::uint32_t RegistryTree::NameAt(KeyNumber parent, std::uint32_t index, std::string& name) {
  for (auto at = FirstBelow(parent); at != places_.end() && at->first.parent == parent; ++at) {
    if (index-- > 0) continue;
    name = at->first.name;
    return kRegistrySuccess;
  }
  return kNoMoreKeys;
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

#pragma once

#include "platform/registry/RegistryStore.h"

#include <map>

namespace quendra::platform::simulated {

/// A registry's keys in memory.
class RegistryTree : public RegistryStore {
 public:
  struct CaseBlind {
    bool operator()(const std::string& left, const std::string& right) const;
  };
  struct Key {
    KeyNumber parent = 0;
    std::string name{};
    std::map<std::string, RegistryValue, CaseBlind> values{};
  };

  /// What each step on a key gives instead of working; 0 for the tree as a whole.
  std::map<KeyNumber, std::uint32_t> Refused;

  std::uint32_t Find(KeyNumber parent, const std::string& name, KeyNumber& key) override;
  std::uint32_t Check(KeyNumber key) override;
  std::uint32_t Make(KeyNumber parent, const std::vector<std::string>& path, KeyNumber& key) override;
  std::uint32_t Remove(KeyNumber key) override;
  std::uint32_t NameAt(KeyNumber parent, std::uint32_t index, std::string& name) override;
  std::uint32_t Read(KeyNumber key, const std::string& name, RegistryValue& value) override;
  std::uint32_t Write(KeyNumber key, const std::string& name, const RegistryValue& value) override;
  std::uint32_t Erase(KeyNumber key, const std::string& name) override;

  /// The key of that name, 0 for none.
  KeyNumber Child(KeyNumber parent, const std::string& name) const;
  /// A key and all below it.
  void RemoveAll(KeyNumber key);

 private:
  /// Where a key stands: its parent, and its name there.
  struct Place {
    KeyNumber parent = 0;
    std::string name{};
  };
  struct ByParentThenName {
    bool operator()(const Place& left, const Place& right) const;
  };
  using Places = std::map<Place, KeyNumber, ByParentThenName>;

  std::uint32_t WhyRefused(KeyNumber key) const;
  /// The keys of a key stand one after the other from here on, by their names.
  Places::const_iterator FirstBelow(KeyNumber parent) const { return places_.lower_bound({parent, {}}); }
  bool HasKeys(KeyNumber key) const;
  KeyNumber Add(KeyNumber parent, const std::string& name);
  void Forget(KeyNumber key);

  std::map<KeyNumber, Key> keys_; ///< roots too, once they have values
  Places places_;
  KeyNumber last_ = 0;
};

} // namespace quendra::platform::simulated

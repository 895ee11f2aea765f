#pragma once

#include "platform/linux/registry/RegistryFile.h"
#include "platform/registry/RegistryStore.h"

namespace quendra::platform::linux_ {

/// The keys of a registry in its file. What fails with damage is tried once more with the new file.
class SqliteRegistryStore : public RegistryStore {
 public:
  SqliteRegistryStore(std::string folder, std::function<void(const std::string& keptAs)> tellOfDamage)
      : file_(std::move(folder), std::move(tellOfDamage)) {}

  std::uint32_t Find(KeyNumber parent, const std::string& name, KeyNumber& key) override;
  std::uint32_t Check(KeyNumber key) override;
  std::uint32_t Make(KeyNumber parent, const std::vector<std::string>& path, KeyNumber& key) override;
  std::uint32_t Remove(KeyNumber key) override;
  std::uint32_t NameAt(KeyNumber parent, std::uint32_t index, std::string& name) override;
  std::uint32_t Read(KeyNumber key, const std::string& name, RegistryValue& value) override;
  std::uint32_t Write(KeyNumber key, const std::string& name, const RegistryValue& value) override;
  std::uint32_t Erase(KeyNumber key, const std::string& name) override;

 private:
  /// Runs a step, which gives a result of the database. `otherwise` is the error for a step that found no
  /// row.
  std::uint32_t Run(const std::function<int(sqlite3*)>& step, std::uint32_t otherwise = kRegistrySuccess);

  RegistryFile file_;
};

} // namespace quendra::platform::linux_

#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

struct sqlite3;

namespace quendra::platform::linux_ {

struct CloseDatabase {
  void operator()(sqlite3* database) const;
};
using Database = std::unique_ptr<sqlite3, CloseDatabase>;

/// The file that holds the registry. It is opened when it is first needed and made where it is missing, with
/// the keys of a fresh system. Several programs may use it at once: each waits for the other, for two seconds
/// at most.
///
/// A file that is found to be damaged is kept beside the new one as "registry.sqlite.damaged-1" and so on.
/// One that is whole but not ours, as of a later edition, is left alone and not used.
class RegistryFile {
 public:
  /// `tellOfDamage` hears under which path a damaged file is kept.
  RegistryFile(std::string folder, std::function<void(const std::string& keptAs)> tellOfDamage)
      : folder_(std::move(folder)), tellOfDamage_(std::move(tellOfDamage)) {}

  /// 0 with an open database, or why there is none.
  std::uint32_t Open(sqlite3*& database);
  /// After a failure: when it was damage, the file is put aside and true says that trying again makes sense.
  bool PutAsideWhenDamaged(int result);

  static constexpr const char* kName = "registry.sqlite";

 private:
  std::uint32_t TryToOpen();
  bool PutAside();
  /// Under a lock that other programs heed, so that none puts aside the new file of another. `keptAs` stays
  /// empty when another program was faster.
  bool MoveAside(std::string& keptAs);
  std::string Path() const { return folder_ + "/" + kName; }

  std::string folder_;
  std::function<void(const std::string& keptAs)> tellOfDamage_;
  Database database_;
};

/// The system's error number for a result of the database.
std::uint32_t RegistryErrorOf(int result);

} // namespace quendra::platform::linux_

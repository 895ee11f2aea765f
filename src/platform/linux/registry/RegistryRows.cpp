#include "platform/linux/registry/RegistryRows.h"

#include "platform/linux/registry/Statement.h"

namespace quendra::platform::linux_ {

int FindKey(sqlite3* database, std::int64_t parent, const std::string& name, std::int64_t& key) {
  Statement find(database, "SELECT number FROM keys WHERE parent = ? AND name = ?");
  const int result = find.With(parent).With(name).Step();
  if (result == SQLITE_ROW) key = find.Number(0);
  return result;
}

int MakeKeys(sqlite3* database, const std::vector<std::string>& path, std::int64_t& key) {
  for (const auto& name : path) {
    const std::int64_t parent = key;
    int result = FindKey(database, parent, name, key);
    if (result == SQLITE_ROW) continue;
    if (result == SQLITE_DONE)
      result =
          Statement(database, "INSERT INTO keys (parent, name) VALUES (?, ?)").With(parent).With(name).Step();
    if (result != SQLITE_DONE) return result;
    key = ::sqlite3_last_insert_rowid(database);
  }
  return SQLITE_OK;
}

} // namespace quendra::platform::linux_

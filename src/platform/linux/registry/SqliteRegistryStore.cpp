#include "platform/linux/registry/SqliteRegistryStore.h"

#include "platform/linux/registry/RegistryRows.h"
#include "platform/linux/registry/Statement.h"

namespace quendra::platform::linux_ {

namespace {

/// A row that the logic's own condition keeps from being deleted.
constexpr int kKept = SQLITE_CONSTRAINT;

int MakeAll(sqlite3* database, const std::vector<std::string>& path, std::int64_t& key) {
  Transaction transaction(database);
  int result = transaction.Begun();
  std::int64_t made = key;
  if (result == SQLITE_OK) result = MakeKeys(database, path, made);
  if (result == SQLITE_OK) result = transaction.Commit();
  if (result == SQLITE_OK) key = made;
  return result;
}

int RemoveKey(sqlite3* database, std::int64_t key) {
  Transaction transaction(database);
  if (transaction.Begun() != SQLITE_OK) return transaction.Begun();
  int result = Statement(database, "SELECT 1 FROM keys WHERE parent = ? LIMIT 1").With(key).Step();
  if (result == SQLITE_ROW) return kKept;
  for (const char* sql : {"DELETE FROM data WHERE key = ?", "DELETE FROM keys WHERE number = ?"})
    if (result == SQLITE_DONE) result = Statement(database, sql).With(key).Step();
  return result == SQLITE_DONE ? transaction.Commit() : result;
}

} // namespace

std::uint32_t SqliteRegistryStore::Run(const std::function<int(sqlite3*)>& step, std::uint32_t otherwise) {
  sqlite3* database = nullptr;
  int result = SQLITE_ERROR;
  // A second time after damage, which the new file can't have.
  for (int attempt = 0; attempt < 2; ++attempt) {
    const std::uint32_t error = file_.Open(database);
    if (error != kRegistrySuccess) return error;
    result = step(database);
    if (!file_.PutAsideWhenDamaged(result)) break;
  }
  return result == SQLITE_DONE ? otherwise : RegistryErrorOf(result);
}

std::uint32_t SqliteRegistryStore::Find(KeyNumber parent, const std::string& name, KeyNumber& key) {
  return Run([&](sqlite3* database) { return FindKey(database, parent, name, key); }, kKeyNotFound);
}

std::uint32_t SqliteRegistryStore::Check(KeyNumber key) {
  return Run(
      [&](sqlite3* database) {
        return Statement(database, "SELECT 1 FROM keys WHERE number = ?").With(key).Step();
      },
      kKeyMarkedDeleted);
}

std::uint32_t SqliteRegistryStore::Make(KeyNumber parent, const std::vector<std::string>& path,
                                        KeyNumber& key) {
  key = parent;
  return Run([&](sqlite3* database) { return MakeAll(database, path, key); });
}

std::uint32_t SqliteRegistryStore::Remove(KeyNumber key) {
  int removed = SQLITE_OK;
  const std::uint32_t error = Run([&](sqlite3* database) { return removed = RemoveKey(database, key); });
  return removed == kKept ? std::uint32_t{kRegistryAccessDenied} : error;
}

std::uint32_t SqliteRegistryStore::NameAt(KeyNumber parent, std::uint32_t index, std::string& name) {
  return Run(
      [&](sqlite3* database) {
        Statement list(database, "SELECT name FROM keys WHERE parent = ? ORDER BY name LIMIT 1 OFFSET ?");
        const int result = list.With(parent).With(std::int64_t{index}).Step();
        if (result == SQLITE_ROW) name = list.Name(0);
        return result;
      },
      kNoMoreKeys);
}

std::uint32_t SqliteRegistryStore::Read(KeyNumber key, const std::string& name, RegistryValue& value) {
  return Run(
      [&](sqlite3* database) {
        Statement read(database, "SELECT type, bytes FROM data WHERE key = ? AND name = ?");
        const int result = read.With(key).With(name).Step();
        if (result == SQLITE_ROW) value = {static_cast<std::uint32_t>(read.Number(0)), read.Data(1)};
        return result;
      },
      kKeyNotFound);
}

std::uint32_t SqliteRegistryStore::Write(KeyNumber key, const std::string& name, const RegistryValue& value) {
  return Run([&](sqlite3* database) {
    return Statement(database, "INSERT INTO data (key, name, type, bytes) VALUES (?, ?, ?, ?) "
                               "ON CONFLICT DO UPDATE SET type = excluded.type, bytes = excluded.bytes")
        .With(key)
        .With(name)
        .With(std::int64_t{value.type})
        .With(std::span(value.data))
        .Step();
  });
}

std::uint32_t SqliteRegistryStore::Erase(KeyNumber key, const std::string& name) {
  return Run(
      [&](sqlite3* database) {
        const int result =
            Statement(database, "DELETE FROM data WHERE key = ? AND name = ?").With(key).With(name).Step();
        return result == SQLITE_DONE && ::sqlite3_changes(database) > 0 ? SQLITE_OK : result;
      },
      kKeyNotFound);
}

} // namespace quendra::platform::linux_

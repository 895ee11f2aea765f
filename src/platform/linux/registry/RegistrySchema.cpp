#include "platform/linux/registry/RegistrySchema.h"

#include "platform/linux/registry/RegistryRows.h"
#include "platform/linux/registry/Statement.h"
#include "platform/registry/FreshKeys.h"

namespace quendra::platform::linux_ {

namespace {

/// Goes up when the tables change.
constexpr std::int64_t kForm = 1;

constexpr const char* kTables = R"(
  CREATE TABLE keys (
    number INTEGER PRIMARY KEY AUTOINCREMENT, -- never given again
    parent INTEGER NOT NULL,                  -- a key's number, or a root's handle
    name TEXT NOT NULL COLLATE NOCASE,
    UNIQUE (parent, name));
  CREATE TABLE data (
    key INTEGER NOT NULL,
    name TEXT NOT NULL COLLATE NOCASE,
    type INTEGER NOT NULL,
    bytes BLOB NOT NULL,
    PRIMARY KEY (key, name)) WITHOUT ROWID;
  -- Above the roots, and elsewhere in each new file: a key that was open in a damaged one is none of the new one's.
  INSERT INTO sqlite_sequence (name, seq) VALUES ('keys', (abs(random() % 1048576) + 1) * 4294967296);
  PRAGMA user_version = 1;
)";

int OneNumber(sqlite3* database, const char* sql, std::int64_t& number) {
  Statement statement(database, sql);
  const int result = statement.Step();
  if (result != SQLITE_ROW) return result == SQLITE_DONE ? SQLITE_ERROR : result;
  number = statement.Number(0);
  return SQLITE_OK;
}

std::vector<std::string> NamesOf(std::string_view path) {
  std::vector<std::string> names;
  for (std::size_t end = 0; end != std::string_view::npos; path.remove_prefix(end + 1)) {
    end = path.find('\\');
    names.emplace_back(path.substr(0, end));
    if (end == std::string_view::npos) break;
  }
  return names;
}

int MakeFreshKeys(sqlite3* database) {
  for (const FreshKey& fresh : FreshKeys()) {
    std::int64_t key = fresh.root.Value();
    const int result = MakeKeys(database, NamesOf(fresh.path), key);
    if (result != SQLITE_OK) return result;
  }
  return SQLITE_OK;
}

int MakeFresh(sqlite3* database) {
  Transaction transaction(database);
  int result = transaction.Begun();
  if (result != SQLITE_OK) return result;
  // Another program may have been faster.
  std::int64_t form = 0;
  result = OneNumber(database, "PRAGMA user_version", form);
  if (result != SQLITE_OK || form == kForm) return result;
  result = ::sqlite3_exec(database, kTables, nullptr, nullptr, nullptr);
  if (result == SQLITE_OK) result = MakeFreshKeys(database);
  return result == SQLITE_OK ? transaction.Commit() : result;
}

/// Every page, without the costly comparison of tables and indexes.
int LookThrough(sqlite3* database) {
  Statement check(database, "PRAGMA quick_check(1)");
  const int result = check.Step();
  if (result != SQLITE_ROW) return result == SQLITE_DONE ? SQLITE_OK : result;
  return check.Name(0) == "ok" ? SQLITE_OK : SQLITE_CORRUPT;
}

} // namespace

int PrepareSchema(sqlite3* database) {
  std::int64_t form = 0;
  std::int64_t tables = 0;
  int result = LookThrough(database);
  // In this order: another program may make both between the two, and tables without a form are none of ours.
  if (result == SQLITE_OK) result = OneNumber(database, "SELECT count(*) FROM sqlite_schema", tables);
  if (result == SQLITE_OK) result = OneNumber(database, "PRAGMA user_version", form);
  if (result != SQLITE_OK) return result;
  if (form == 0 && tables == 0) return MakeFresh(database);
  return form == kForm ? SQLITE_OK : SQLITE_MISMATCH;
}

} // namespace quendra::platform::linux_

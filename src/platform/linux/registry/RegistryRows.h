#pragma once

#include <cstdint>
#include <string>
#include <vector>

struct sqlite3;

namespace quendra::platform::linux_ {

/// Finds the key of that name; SQLITE_ROW with its number, SQLITE_DONE for none.
int FindKey(sqlite3* database, std::int64_t parent, const std::string& name, std::int64_t& key);
/// Goes down the path from `key` and makes what is missing; SQLITE_OK with the last key's number in `key`. To
/// be called within a transaction.
int MakeKeys(sqlite3* database, const std::vector<std::string>& path, std::int64_t& key);

} // namespace quendra::platform::linux_

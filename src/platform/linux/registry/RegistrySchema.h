#pragma once

struct sqlite3;

namespace quendra::platform::linux_ {

/// Makes an empty database a fresh registry, and looks at one that isn't empty. Gives a result of the
/// database: damage is found here as far as a look at every page finds it, and a database of another form is
/// an error of its own.
int PrepareSchema(sqlite3* database);

} // namespace quendra::platform::linux_

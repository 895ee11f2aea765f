#include "platform/linux/registry/RegistryFile.h"

#include "platform/linux/registry/RegistrySchema.h"
#include "platform/linux/system/Descriptor.h"
#include "platform/linux/system/Files.h"
#include "platform/registry/RegistryNumbers.h"

#include <fcntl.h>
#include <sqlite3.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>

namespace quendra::platform::linux_ {

namespace {

constexpr int kMostWaits = 2000;
constexpr int kMostDamagedFiles = 1000;

bool IsDamage(int result) {
  const int kind = result & 0xFF;
  return kind == SQLITE_CORRUPT || kind == SQLITE_NOTADB;
}

/// A pipe or a device at the file's place would be waited on.
bool IsNoPipeNorDevice(const std::string& path) {
  struct stat file {};
  return ::stat(path.c_str(), &file) != 0 || S_ISREG(file.st_mode);
}

/// Waits a millisecond for the other program, two seconds in all. The database's own waits grow to a tenth of
/// a second, and would miss the moments at which one that writes on and on lets others in.
int WaitForOther(void*, int waits) {
  ::usleep(1000);
  return waits < kMostWaits ? 1 : 0;
}

int OpenDatabase(const std::string& path, Database& database) {
  sqlite3* opened = nullptr;
  int result = ::sqlite3_open_v2(path.c_str(), &opened,
                                 SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE | SQLITE_OPEN_EXRESCODE, nullptr);
  database.reset(opened);
  if (result != SQLITE_OK) return result;
  ::sqlite3_busy_handler(opened, WaitForOther, nullptr);
  // What is damaged on purpose does no more than be found to be damaged.
  ::sqlite3_db_config(opened, SQLITE_DBCONFIG_DEFENSIVE, 1, nullptr);
  ::sqlite3_db_config(opened, SQLITE_DBCONFIG_TRUSTED_SCHEMA, 0, nullptr);
  return PrepareSchema(opened);
}

/// Empty when another program has kept the lock for too long, or no file for it can be made.
Descriptor LockBeside(const std::string& path, int kind) {
  Descriptor lock(
      ::open((path + ".lock").c_str(), O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW | O_NONBLOCK, 0600));
  for (int waits = 0; lock && ::flock(lock.Number(), kind | LOCK_NB) != 0; ++waits)
    if (WaitForOther(nullptr, waits) == 0) return {};
  return lock;
}

/// Not while another program puts the file aside, which would take away what belongs to a new one. Where
/// there can be no lock nothing can be put aside either.
int OpenUnmoved(const std::string& path, Database& database) {
  const Descriptor lock = LockBeside(path, LOCK_SH);
  return OpenDatabase(path, database);
}

/// Gives the file another name without taking that of a third: false when another program was faster.
bool RenameToFree(const std::string& path, std::string& name) {
  for (int number = 1; number <= kMostDamagedFiles; ++number) {
    name = path + ".damaged-" + std::to_string(number);
    if (::renameat2(AT_FDCWD, path.c_str(), AT_FDCWD, name.c_str(), RENAME_NOREPLACE) == 0) return true;
    if (errno != EEXIST) return false;
  }
  return false;
}

} // namespace

void CloseDatabase::operator()(sqlite3* database) const { ::sqlite3_close_v2(database); }

std::uint32_t RegistryErrorOf(int result) {
  switch (result & 0xFF) {
  case SQLITE_OK:
  case SQLITE_ROW:
  case SQLITE_DONE: return kRegistrySuccess;
  case SQLITE_BUSY:
  case SQLITE_LOCKED: return kRegistryBusy;
  case SQLITE_CANTOPEN:
  case SQLITE_PERM:
  case SQLITE_READONLY:
  case SQLITE_AUTH: return kRegistryAccessDenied;
  case SQLITE_FULL: return kRegistryDiskFull;
  case SQLITE_NOMEM: return kRegistryOutOfMemory;
  case SQLITE_TOOBIG: return kRegistryInvalidParameter;
  case SQLITE_IOERR: return kRegistryInputOutput;
  default: return kRegistryBroken;
  }
}

std::uint32_t RegistryFile::Open(sqlite3*& database) {
  if (!database_) {
    const std::uint32_t error = TryToOpen();
    if (error != kRegistrySuccess) return error;
  }
  database = database_.get();
  return kRegistrySuccess;
}

std::uint32_t RegistryFile::TryToOpen() {
  if (MakeFolders(folder_) != 0) return kRegistryAccessDenied;
  if (!IsNoPipeNorDevice(Path())) return kRegistryBroken;
  int result = OpenUnmoved(Path(), database_);
  if (IsDamage(result) && PutAside()) result = OpenUnmoved(Path(), database_);
  if (result != SQLITE_OK) database_.reset();
  return RegistryErrorOf(result);
}

bool RegistryFile::PutAsideWhenDamaged(int result) { return IsDamage(result) && PutAside(); }

bool RegistryFile::PutAside() {
  std::string keptAs;
  if (!MoveAside(keptAs)) return false;
  if (!keptAs.empty() && tellOfDamage_) tellOfDamage_(keptAs);
  return true;
}

bool RegistryFile::MoveAside(std::string& keptAs) {
  database_.reset();
  const Descriptor lock = LockBeside(Path(), LOCK_EX);
  if (!lock) return false;
  // Another program may have put it aside meanwhile.
  Database current;
  if (!IsDamage(OpenDatabase(Path(), current))) return true;
  current.reset();
  if (!RenameToFree(Path(), keptAs)) return false;
  // What belongs to the damaged file goes with it: the new one must not be taken for it.
  for (const char* companion : {"-journal", "-wal", "-shm"})
    ::rename((Path() + companion).c_str(), (keptAs + companion).c_str());
  return true;
}

} // namespace quendra::platform::linux_

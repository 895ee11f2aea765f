#pragma once

#include "forms/MessageLoop.h"
#include "platform/registry/Registry.h"

namespace quendra::foundation {

/// Writes registry values by one text path, root first, as in
/// "HKEY_LOCAL_MACHINE\SYSTEM\CurrentControlSet\Services\NPF". A badly formed path shows a box; what the
/// registry refuses is silent and ends in LastRegStatus.
class RegEdit {
 public:
  RegEdit(platform::Registry& registry, forms::MessageLoop& loop) : registry_(registry), loop_(loop) {}

  /// kNoRegistryKey for any other name.
  static platform::RegistryKey HiveFromName(const Text& name);
  /// Cuts `path` to what stands behind the root. A badly formed path stays as it was, and so does `hive`:
  /// what the caller does next goes to the root of the call before, with the whole path as a key's name.
  void SplitRegPath(Text& path, platform::RegistryKey& hive);

  void CreateRegKey(Text path);
  // These write into a key that is there; none makes it.
  void SetRegDword(Text path, const Text& name, std::uint32_t data);
  /// Without a closing NUL.
  void SetRegString(Text path, const Text& name, const Text& data);
  /// A byte for each character, its code in the code page. An empty text is fault 9.
  void SetRegBinary(Text path, const Text& name, const Text& data);

  /// The root of the last path that was well formed; kNoRegistryKey when it named none.
  platform::RegistryKey LastHive() const { return hive_; }
  /// The key that the last call opened. It is closed since.
  platform::RegistryKey LastRegKey() const { return key_; }
  /// Where the first backslash of the last path stood, counted from 1, or what the registry said after that.
  std::uint32_t LastRegStatus() const { return status_; }

 private:
  /// Splits the path and opens its key for writing; false when there is nothing to go on with.
  bool OpenForWriting(Text& path);
  void WriteAndClose(const Text& name, std::uint32_t type, std::span<const std::uint8_t> data);

  platform::Registry& registry_;
  forms::MessageLoop& loop_;
  platform::RegistryKey hive_;
  platform::RegistryKey key_;
  std::uint32_t status_ = 0;
};

} // namespace quendra::foundation

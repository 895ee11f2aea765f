#include "foundation/RegEdit.h"

#include "runtime/ByteFields.h"
#include "runtime/Fault.h"

#include <array>
#include <vector>

namespace quendra::foundation {

namespace {

struct Hive {
  TextView name;
  platform::RegistryKey key;
};

constexpr std::array kHives{
    Hive{u"HKEY_CLASSES_ROOT", platform::kClassesRoot},
    Hive{u"HKEY_CURRENT_USER", platform::kCurrentUser},
    Hive{u"HKEY_LOCAL_MACHINE", platform::kLocalMachine},
    Hive{u"HKEY_USERS", platform::kUsers},
    Hive{u"HKEY_PERFORMANCE_DATA", platform::kPerformanceData},
    Hive{u"HKEY_CURRENT_CONFIG", platform::kCurrentConfig},
    Hive{u"HKEY_DYN_DATA", platform::kDynData},
};

/// A box without a named title has the program's name.
constexpr const char16_t* kDefaultTitle = u"Quendra";

std::vector<std::uint8_t> BytesOf(const Text& text) {
  const std::string bytes = ToCodePage(text);
  return {bytes.begin(), bytes.end()};
}

} // namespace

platform::RegistryKey RegEdit::HiveFromName(const Text& name) {
  for (const Hive& hive : kHives)
    if (hive.name == name) return hive.key;
  return platform::kNoRegistryKey;
}

void RegEdit::SplitRegPath(Text& path, platform::RegistryKey& hive) {
  const std::size_t backslash = path.find(u'\\');
  status_ = backslash == Text::npos ? 0 : static_cast<std::uint32_t>(backslash + 1);
  if (!path.starts_with(u"HKEY_") || path.ends_with(u'\\')) {
    loop_.MessageBox(u"Incorrect Format:\n\n" + path, 0, kDefaultTitle);
    return;
  }
  hive = HiveFromName(path.substr(0, backslash));
  path.erase(0, backslash == Text::npos ? backslash : backslash + 1);
}

void RegEdit::CreateRegKey(Text path) {
  SplitRegPath(path, hive_);
  if (hive_ == platform::kNoRegistryKey) return;
  status_ = registry_.RegCreateKeyA(hive_, ToCodePage(path), key_);
  if (status_ == platform::kRegistrySuccess) status_ = registry_.RegCloseKey(key_);
}

bool RegEdit::OpenForWriting(Text& path) {
  SplitRegPath(path, hive_);
  if (hive_ == platform::kNoRegistryKey) return false;
  status_ = registry_.RegOpenKeyExA(hive_, ToCodePage(path), platform::kKeyWrite, key_);
  return status_ == platform::kRegistrySuccess;
}

void RegEdit::WriteAndClose(const Text& name, std::uint32_t type, std::span<const std::uint8_t> data) {
  status_ = registry_.RegSetValueExA(key_, ToCodePage(name), type, data);
  status_ = registry_.RegCloseKey(key_);
}

void RegEdit::SetRegDword(Text path, const Text& name, std::uint32_t data) {
  if (!OpenForWriting(path)) return;
  std::array<std::uint8_t, 4> bytes{};
  PutLittle32(bytes, 0, data);
  WriteAndClose(name, platform::kRegDword, bytes);
}

void RegEdit::SetRegString(Text path, const Text& name, const Text& data) {
  if (!OpenForWriting(path)) return;
  WriteAndClose(name, platform::kRegText, BytesOf(data));
}

void RegEdit::SetRegBinary(Text path, const Text& name, const Text& data) {
  if (!OpenForWriting(path)) return;
  // There is no array of no bytes: the fault leaves the key open.
  if (data.empty()) throw Fault(Fault::kSubscript);
  WriteAndClose(name, platform::kRegBinary, BytesOf(data));
}

} // namespace quendra::foundation

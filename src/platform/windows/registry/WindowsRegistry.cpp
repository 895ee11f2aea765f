#include "platform/windows/registry/WindowsRegistry.h"

#include "platform/registry/RegistryPath.h"
#include "platform/windows/registry/RegistryTexts.h"

#include <algorithm>
#include <array>

namespace quendra::platform::windows {

namespace {

/// What one call of the system can make.
constexpr std::size_t kMostLevelsAtOnce = 32;
constexpr std::size_t kKeyNameRoom = 256;
/// A value that others keep lengthening isn't read for ever.
constexpr int kMostAttempts = 10;

HKEY ToSystem(RegistryKey key) { return reinterpret_cast<HKEY>(std::uintptr_t{key.Value()}); }
RegistryKey FromSystem(HKEY key) {
  return RegistryKey(static_cast<std::uint32_t>(reinterpret_cast<std::uintptr_t>(key)));
}

/// The path up to its NUL in the system's characters; an error number for one that no registry takes.
std::uint32_t CheckedPath(const std::string& path, Text& checked) {
  std::vector<std::string> names;
  checked = FromCodePage(CutAtNul(std::string_view(path)));
  return NamesOfRegistryPath(path, names);
}

std::uint32_t CheckedName(const std::string& given, Text& checked) {
  std::string name;
  const std::uint32_t error = NameOfRegistryValue(given, name);
  checked = FromCodePage(name);
  return error;
}

/// The path parted so that each part can be made at once.
std::vector<Text> Parts(const Text& path) {
  std::vector<Text> parts(1);
  std::size_t levels = 0;
  for (const char16_t unit : path) {
    const bool isFull = unit == u'\\' && ++levels % kMostLevelsAtOnce == 0;
    if (isFull)
      parts.emplace_back();
    else
      parts.back().push_back(unit);
  }
  return parts;
}

} // namespace

template <typename Function, typename... Arguments>
std::uint32_t WindowsRegistry::Call(const char* name, Arguments... arguments) {
  const auto function = advapi32_.Find<Function>(name);
  return function ? static_cast<std::uint32_t>(function(arguments...))
                  : std::uint32_t{kRegistryCallNotImplemented};
}

std::uint32_t WindowsRegistry::Make(RegistryKey parent, const Text& path, RegistryKey& key) {
  HKEY made = nullptr;
  const std::uint32_t error =
      Call<decltype(::RegCreateKeyExW)>("RegCreateKeyExW", ToSystem(parent), winapi::Wide(path), 0, nullptr,
                                        REG_OPTION_NON_VOLATILE, MAXIMUM_ALLOWED, nullptr, &made, nullptr);
  if (error == kRegistrySuccess) key = FromSystem(made);
  return error;
}

std::uint32_t WindowsRegistry::RegCreateKeyA(RegistryKey parent, const std::string& path, RegistryKey& key) {
  Text checked;
  std::uint32_t error = CheckedPath(path, checked);
  RegistryKey deepest = parent;
  for (const Text& part : Parts(checked)) {
    if (error != kRegistrySuccess) break;
    const RegistryKey above = deepest;
    error = Make(above, part, deepest);
    if (above != parent) RegCloseKey(above);
  }
  if (error == kRegistrySuccess) key = deepest;
  return error;
}

std::uint32_t WindowsRegistry::RegOpenKeyExA(RegistryKey parent, const std::string& path,
                                             std::uint32_t access, RegistryKey& key) {
  Text checked;
  HKEY opened = nullptr;
  std::uint32_t error = CheckedPath(path, checked);
  if (error == kRegistrySuccess)
    error = Call<decltype(::RegOpenKeyExW)>("RegOpenKeyExW", ToSystem(parent), winapi::Wide(checked), 0,
                                            access, &opened);
  if (error == kRegistrySuccess) key = FromSystem(opened);
  return error;
}

std::uint32_t WindowsRegistry::RegSetValueExA(RegistryKey key, const std::string& name, std::uint32_t type,
                                              std::span<const std::uint8_t> data) {
  Text checked;
  if (const std::uint32_t error = CheckedName(name, checked)) return error;
  std::vector<std::uint8_t> kept =
      IsRegistryText(type) ? CharactersOfText(data) : std::vector<std::uint8_t>(data.begin(), data.end());
  const auto size = static_cast<DWORD>(kept.size());
  // The system counts a NUL behind a text as the text's own: none stands there.
  kept.insert(kept.end(), {0xFF, 0xFF});
  return Call<decltype(::RegSetValueExW)>("RegSetValueExW", ToSystem(key), winapi::Wide(checked), 0, type,
                                          kept.data(), size);
}

std::uint32_t WindowsRegistry::Read(RegistryKey key, const Text& name, std::uint32_t& type,
                                    std::vector<std::uint8_t>& data) {
  std::uint32_t error = kMoreValueData;
  DWORD size = 0;
  for (int attempt = 0; error == kMoreValueData && attempt < kMostAttempts; ++attempt) {
    // Room for a byte at least: without any, the size alone would be told.
    data.resize(std::max<std::size_t>({size, 2 * data.size(), 64}));
    size = static_cast<DWORD>(data.size());
    DWORD kind = 0;
    error = Call<decltype(::RegQueryValueExW)>("RegQueryValueExW", ToSystem(key), winapi::Wide(name), nullptr,
                                               &kind, data.data(), &size);
    type = error == kRegistrySuccess ? kind : type;
  }
  data.resize(error == kRegistrySuccess ? std::min<std::size_t>(size, data.size()) : 0);
  return error;
}

std::uint32_t WindowsRegistry::RegQueryValueExA(RegistryKey key, const std::string& name, std::uint32_t& type,
                                                std::span<std::uint8_t> buffer, std::uint32_t& size) {
  Text checked;
  std::vector<std::uint8_t> data;
  std::uint32_t error = CheckedName(name, checked);
  if (error == kRegistrySuccess) error = Read(key, checked, type, data);
  if (error != kRegistrySuccess) return error;
  if (IsRegistryText(type)) data = BytesOfText(data);
  size = static_cast<std::uint32_t>(data.size());
  if (buffer.data() == nullptr) return kRegistrySuccess;
  if (buffer.size() < data.size()) return kMoreValueData;
  std::ranges::copy(data, buffer.begin());
  return kRegistrySuccess;
}

std::uint32_t WindowsRegistry::RegCloseKey(RegistryKey key) {
  return Call<decltype(::RegCloseKey)>("RegCloseKey", ToSystem(key));
}

std::uint32_t WindowsRegistry::RegDeleteKeyA(RegistryKey parent, const std::string& path) {
  Text checked;
  if (const std::uint32_t error = CheckedPath(path, checked)) return error;
  if (checked.empty() && IsRegistryRoot(parent)) return kRegistryAccessDenied;
  return Call<decltype(::RegDeleteKeyW)>("RegDeleteKeyW", ToSystem(parent), winapi::Wide(checked));
}

std::uint32_t WindowsRegistry::RegDeleteValueA(RegistryKey key, const std::string& name) {
  Text checked;
  if (const std::uint32_t error = CheckedName(name, checked)) return error;
  return Call<decltype(::RegDeleteValueW)>("RegDeleteValueW", ToSystem(key), winapi::Wide(checked));
}

std::uint32_t WindowsRegistry::RegEnumKeyExA(RegistryKey key, std::uint32_t index, std::string& name) {
  std::array<wchar_t, kKeyNameRoom> told{};
  DWORD length = kKeyNameRoom;
  const std::uint32_t error = Call<decltype(::RegEnumKeyExW)>(
      "RegEnumKeyExW", ToSystem(key), index, told.data(), &length, nullptr, nullptr, nullptr, nullptr);
  if (error == kRegistrySuccess) name = ToCodePage(winapi::TextOf(told.data(), length));
  return error;
}

} // namespace quendra::platform::windows

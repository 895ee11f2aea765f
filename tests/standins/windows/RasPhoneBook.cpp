#include "standins/windows/RasPhoneBook.h"

#include "platform/remote_access/RemoteAccessNumbers.h"

#include <algorithm>

namespace quendra::standins {

namespace {

constexpr const char* kProperties = "Properties";
constexpr const char* kAlternateNumbers = "AlternateNumbers";
constexpr const char* kDialParams = "DialParams";
constexpr DWORD kMostCharacters = 1 << 16;

std::string FileOfBook() {
  char path[MAX_PATH] = {};
  const DWORD length = ::GetEnvironmentVariableA("QUENDRA_PHONE_BOOK", path, sizeof path);
  if (length > 0 && length < sizeof path) return path;
  ::GetWindowsDirectoryA(path, sizeof path);
  return std::string(path) + "\\quendra-phone-book.ini";
}

int Nibble(char digit) {
  if (digit >= '0' && digit <= '9') return digit - '0';
  return digit >= 'A' && digit <= 'F' ? digit - 'A' + 10 : -1;
}

std::string HexOf(const std::vector<std::uint8_t>& image) {
  constexpr const char* kDigits = "0123456789ABCDEF";
  std::string hex;
  for (const std::uint8_t byte : image) {
    hex += kDigits[byte >> 4];
    hex += kDigits[byte & 15];
  }
  return hex;
}

std::vector<std::uint8_t> ImageOf(const std::string& hex) {
  std::vector<std::uint8_t> image;
  for (std::size_t i = 0; i + 1 < hex.size() && Nibble(hex[i]) >= 0 && Nibble(hex[i + 1]) >= 0; i += 2)
    image.push_back(static_cast<std::uint8_t>(Nibble(hex[i]) * 16 + Nibble(hex[i + 1])));
  return image;
}

} // namespace

RasPhoneBook::RasPhoneBook() : file_(FileOfBook()) {}

std::vector<std::string> RasPhoneBook::Names() const {
  std::string texts(kMostCharacters, '\0');
  const DWORD length = ::GetPrivateProfileSectionNamesA(texts.data(), kMostCharacters, file_.c_str());
  std::vector<std::string> names;
  for (std::size_t at = 0; at < length && texts[at] != '\0'; at += names.back().size() + 1)
    names.emplace_back(texts.c_str() + at);
  return names;
}

bool RasPhoneBook::Has(const std::string& name) const {
  return std::ranges::any_of(
      Names(), [&](const std::string& one) { return ::lstrcmpiA(one.c_str(), name.c_str()) == 0; });
}

bool RasPhoneBook::Remove(const std::string& name) const {
  return Has(name) && ::WritePrivateProfileStringA(name.c_str(), nullptr, nullptr, file_.c_str());
}

RasPhoneBook::Image RasPhoneBook::Read(const std::string& name, const char* key) const {
  std::string hex(kMostCharacters, '\0');
  const DWORD length =
      ::GetPrivateProfileStringA(name.c_str(), key, "", hex.data(), kMostCharacters, file_.c_str());
  hex.resize(length);
  return ImageOf(hex);
}

bool RasPhoneBook::Write(const std::string& name, const char* key, const Image& image) const {
  return ::WritePrivateProfileStringA(name.c_str(), key, HexOf(image).c_str(), file_.c_str());
}

RasPhoneBook::Image RasPhoneBook::Properties(const std::string& name) const {
  return Read(name, kProperties);
}

RasPhoneBook::Image RasPhoneBook::AlternateNumbers(const std::string& name) const {
  return Read(name, kAlternateNumbers);
}

bool RasPhoneBook::Write(const std::string& name, const Image& properties,
                         const Image& alternateNumbers) const {
  return Write(name, kProperties, properties) && Write(name, kAlternateNumbers, alternateNumbers);
}

RasPhoneBook::Image RasPhoneBook::DialParams(const std::string& name) const {
  Image params = Read(name, kDialParams);
  params.resize(platform::RasDialParams::kBytes);
  return params;
}

bool RasPhoneBook::WriteDialParams(const std::string& name, const Image& params) const {
  return Write(name, kDialParams, params);
}

} // namespace quendra::standins

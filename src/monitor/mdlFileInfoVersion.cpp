#include "monitor/mdlFileInfo.h"
#include "runtime/ByteFields.h"

#include <algorithm>

namespace quendra::monitor {

namespace {

constexpr std::size_t kValueRoom = 255;

struct VersionName {
  const char* name;
  Text FileVersionInfo::*field;
};

constexpr std::array<VersionName, 8> kVersionNames{{
    {"CompanyName", &FileVersionInfo::CompanyName},
    {"FileDescription", &FileVersionInfo::FileDescription},
    {"FileVersion", &FileVersionInfo::FileVersion},
    {"InternalName", &FileVersionInfo::InternalName},
    {"LegalCopyright", &FileVersionInfo::LegalCopyright},
    {"OriginalFileName", &FileVersionInfo::OriginalFileName},
    {"ProductName", &FileVersionInfo::ProductName},
    {"ProductVersion", &FileVersionInfo::ProductVersion},
}};

/// Language before code page, each a 16-bit number with its low byte first; bytes that are missing count as
/// 0.
std::string TranslationText(const std::vector<std::uint8_t>& translation) {
  std::array<std::uint8_t, 4> bytes{};
  std::copy_n(translation.begin(), std::min(translation.size(), bytes.size()), bytes.begin());
  const std::uint32_t number = std::uint32_t{Little16(bytes, 0)} << 16 | Little16(bytes, 2);
  return ToCodePage(PaddedLeft(HexText(number), 8, u'0'));
}

Text ValueText(const std::optional<std::vector<std::uint8_t>>& value) {
  if (!value) return u"?";
  const std::string_view bytes(reinterpret_cast<const char*>(value->data()), value->size());
  return FromCodePage(CutAtNul(bytes.substr(0, kValueRoom)));
}

} // namespace

FileVersionInfo mdlFileInfo::ReadFileVersionInfo(const Text& path) {
  FileVersionInfo info;
  if (path.empty()) return info;
  const std::string file = ToCodePage(path);
  const auto size = static_cast<std::int32_t>(versions_.GetFileVersionInfoSizeA(file));
  if (size <= 0) return info;
  std::vector<std::uint8_t> block(static_cast<std::size_t>(size));
  if (!versions_.GetFileVersionInfoA(file, block)) return info;
  const auto translation = versions_.VerQueryValueA(block, std::string(versions_.kTranslation));
  if (!translation) return info;
  const std::string section = std::string(versions_.kTexts) + TranslationText(*translation) + "\\";
  for (const VersionName& version : kVersionNames)
    info.*version.field = ValueText(versions_.VerQueryValueA(block, section + version.name));
  return info;
}

Text mdlFileInfo::ApplicationNameOf(const Text& path) {
  const Text product = ReadFileVersionInfo(path).ProductName;
  const Text shortened = Replaced(product, u"Microsoft® Windows® Operating System", u"MS® Windows");
  return Replaced(shortened, u"Windows®", u"");
}

} // namespace quendra::monitor

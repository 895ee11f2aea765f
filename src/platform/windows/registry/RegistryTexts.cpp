#include "platform/windows/registry/RegistryTexts.h"

#include "platform/registry/RegistryNumbers.h"
#include "runtime/ByteFields.h"
#include "runtime/Text.h"

namespace quendra::platform::windows {

namespace {

constexpr std::uint32_t kWithVariables = 2;
constexpr std::uint32_t kSeveralTexts = 7;

} // namespace

bool IsRegistryText(std::uint32_t type) {
  return type == kRegText || type == kWithVariables || type == kSeveralTexts;
}

std::vector<std::uint8_t> CharactersOfText(std::span<const std::uint8_t> bytes) {
  const Text text = FromCodePage({reinterpret_cast<const char*>(bytes.data()), bytes.size()});
  std::vector<std::uint8_t> characters(2 * text.size());
  for (std::size_t i = 0; i < text.size(); ++i) PutLittle16(characters, 2 * i, text[i]);
  return characters;
}

std::vector<std::uint8_t> BytesOfText(std::span<const std::uint8_t> characters) {
  Text text(characters.size() / 2, u'\0');
  for (std::size_t i = 0; i < text.size(); ++i) text[i] = Little16(characters, 2 * i);
  const std::string bytes = ToCodePage(text);
  return {bytes.begin(), bytes.end()};
}

} // namespace quendra::platform::windows

#include "platform/process/VersionBlock.h"

#include "runtime/ByteFields.h"

#include <algorithm>

namespace quendra::platform {

namespace {

using Block = std::span<const std::uint8_t>;

constexpr std::size_t kHeaderBytes = 6;
constexpr std::size_t kValueLengthAt = 2;
constexpr std::size_t kKindAt = 4;
constexpr std::uint16_t kOfCharacters = 1;
constexpr std::size_t kUnit = sizeof(char16_t);

std::size_t Aligned(std::size_t at) { return (at + 3) / 4 * 4; }

/// Where the parts of a node lie in the block.
struct Node {
  Text name{};
  bool isText = false;
  std::size_t value = 0;
  std::size_t valueEnd = 0;
  std::size_t nodes = 0;
  std::size_t end = 0;
};

/// Up to the NUL or to the end.
Text CharactersAt(Block block, std::size_t at, std::size_t end) {
  Text text;
  for (; end - at >= kUnit && Little16(block, at) != 0; at += kUnit)
    text.push_back(static_cast<char16_t>(Little16(block, at)));
  return text;
}

/// The node at a place; nothing where none fits before `end`.
std::optional<Node> NodeAt(Block block, std::size_t at, std::size_t end) {
  if (at > end || end - at < kHeaderBytes) return {};
  const std::size_t length = Little16(block, at);
  if (length < kHeaderBytes || length > end - at) return {};
  Node node;
  node.end = at + length;
  node.isText = Little16(block, at + kKindAt) == kOfCharacters;
  node.name = CharactersAt(block, at + kHeaderBytes, node.end);
  const std::size_t valueBytes = Little16(block, at + kValueLengthAt) * (node.isText ? kUnit : 1);
  node.value = std::min(Aligned(at + kHeaderBytes + kUnit * (node.name.size() + 1)), node.end);
  // Some tools count the bytes of a text: it ends with its node all the same.
  node.valueEnd = node.value + std::min(valueBytes, node.end - node.value);
  node.nodes = Aligned(node.valueEnd);
  return node;
}

std::optional<Node> NodeOfName(Block block, const Node& parent, TextView name) {
  std::size_t at = parent.nodes;
  for (auto node = NodeAt(block, at, parent.end); node; node = NodeAt(block, at, parent.end)) {
    if (SameIgnoringCase(node->name, name)) return node;
    at = Aligned(node->end);
  }
  return {};
}

std::vector<std::uint8_t> ValueOf(Block block, const Node& node) {
  if (!node.isText) {
    const Block value = block.subspan(node.value, node.valueEnd - node.value);
    return {value.begin(), value.end()};
  }
  const std::string text = ToCodePage(CharactersAt(block, node.value, node.valueEnd));
  std::vector<std::uint8_t> value(text.begin(), text.end());
  value.push_back(0);
  return value;
}

} // namespace

std::optional<std::vector<std::uint8_t>> ValueOfVersionBlock(Block block, TextView path) {
  std::optional<Node> node = NodeAt(block, 0, block.size());
  while (node && !path.empty()) {
    const std::size_t end = std::min(path.find(u'\\'), path.size());
    // A backslash before the first name, or a second one between two, parts nothing.
    if (end > 0) node = NodeOfName(block, *node, path.substr(0, end));
    path.remove_prefix(std::min(end + 1, path.size()));
  }
  if (!node) return {};
  return ValueOf(block, *node);
}

} // namespace quendra::platform

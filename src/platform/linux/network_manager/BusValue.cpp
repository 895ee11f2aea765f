#include "platform/linux/network_manager/BusValue.h"

#include <string_view>

namespace quendra::platform::linux_ {

namespace {

constexpr int kDeepest = 16;

/// The library reads and takes a number in the width of its type.
union Basic {
  std::uint64_t wide = 0;
  std::uint32_t number;
  std::uint16_t half;
  std::uint8_t byte;
  int truth;
  const char* text;
};

std::uint64_t BitsOf(char kind, const Basic& basic) {
  switch (kind) {
  case 'y': return basic.byte;
  case 'b': return basic.truth != 0 ? 1 : 0;
  case 'n':
  case 'q': return basic.half;
  case 'i':
  case 'u': return basic.number;
  default: return basic.wide;
  }
}

Basic BasicOf(const BusValue& value) {
  Basic basic;
  switch (value.kind) {
  case 'y': basic.byte = static_cast<std::uint8_t>(value.number); break;
  case 'b': basic.truth = value.number != 0 ? 1 : 0; break;
  case 'n':
  case 'q': basic.half = static_cast<std::uint16_t>(value.number); break;
  case 'i':
  case 'u': basic.number = static_cast<std::uint32_t>(value.number); break;
  default: basic.wide = value.number;
  }
  return basic;
}

bool IsContainer(char kind) { return std::string_view("arev").find(kind) != std::string_view::npos; }
bool IsNumber(char kind) { return std::string_view("ybnqiuxtd").find(kind) != std::string_view::npos; }

bool ReadBasic(const BusLibrary& library, void* message, BusValue& value) {
  Basic basic;
  if (!value.IsText() && !IsNumber(value.kind)) return false;
  if (library.message_read_basic(message, value.kind, &basic) <= 0) return false;
  if (value.IsText())
    value.text = basic.text;
  else
    value.number = BitsOf(value.kind, basic);
  return true;
}

bool ReadItems(const BusLibrary& library, void* message, BusValue& value, int depth) {
  if (depth >= kDeepest) return false;
  if (library.message_enter_container(message, value.kind, value.contents.c_str()) <= 0) return false;
  char kind = 0;
  const char* contents = nullptr;
  while (library.message_peek_type(message, &kind, &contents) > 0) {
    auto item = ReadValue(library, message, depth + 1);
    if (!item) return false;
    value.items.push_back(std::move(*item));
  }
  return library.message_exit_container(message) >= 0;
}

} // namespace

std::string BusValue::Signature() const {
  switch (kind) {
  case 'a': return "a" + contents;
  case 'r': return "(" + contents + ")";
  case 'e': return "{" + contents + "}";
  default: return std::string(1, kind);
  }
}

std::optional<BusValue> ReadValue(const BusLibrary& library, void* message, int depth) {
  BusValue value;
  const char* contents = nullptr;
  if (library.message_peek_type(message, &value.kind, &contents) <= 0) return {};
  if (contents) value.contents = contents;
  const bool isRead = IsContainer(value.kind) ? ReadItems(library, message, value, depth)
                                              : ReadBasic(library, message, value);
  return isRead ? std::optional(std::move(value)) : std::nullopt;
}

bool AppendValue(const BusLibrary& library, void* message, const BusValue& value) {
  if (!IsContainer(value.kind)) {
    const Basic basic = BasicOf(value);
    const void* what = value.IsText() ? static_cast<const void*>(value.text.c_str()) : &basic;
    return library.message_append_basic(message, value.kind, what) >= 0;
  }
  if (library.message_open_container(message, value.kind, value.contents.c_str()) < 0) return false;
  for (const BusValue& item : value.items)
    if (!AppendValue(library, message, item)) return false;
  return library.message_close_container(message) >= 0;
}

TextMap TextMapOf(const BusValue& value) {
  TextMap texts;
  for (const BusValue& pair : value.items)
    if (pair.items.size() == 2 && pair.items[0].IsText() && pair.items[1].IsText())
      texts[pair.items[0].text] = pair.items[1].text;
  return texts;
}

BusValue ValueOf(const TextMap& texts) {
  BusValue value = BusValue::Array("{ss}", {});
  for (const auto& [name, text] : texts)
    value.items.push_back({'e', "ss", 0, {}, {BusValue::Text(name), BusValue::Text(text)}});
  return value;
}

ValueMap ValueMapOf(const BusValue& value) {
  ValueMap values;
  for (const BusValue& pair : value.items)
    if (pair.items.size() == 2 && pair.items[0].IsText() && pair.items[1].items.size() == 1)
      values[pair.items[0].text] = pair.items[1].items.front();
  return values;
}

BusValue ValueOf(const ValueMap& values) {
  BusValue value = BusValue::Array("{sv}", {});
  for (const auto& [name, held] : values)
    value.items.push_back({'e', "sv", 0, {}, {BusValue::Text(name), {'v', held.Signature(), 0, {}, {held}}}});
  return value;
}

} // namespace quendra::platform::linux_

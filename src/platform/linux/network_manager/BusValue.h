#pragma once

#include "platform/linux/system/BusLibrary.h"

#include <map>
#include <optional>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// A value of the bus, of whatever type: what others keep in a connection must be given back as it was.
struct BusValue {
  char kind = 's'; ///< as the bus library tells it: 'a', 'r' for a structure, 'e' for a pair, 'v', or basic
  std::string contents{};   ///< signature of what is in an array, structure, pair or variant
  std::uint64_t number = 0; ///< of a basic type that is no text: its bits
  std::string text{};
  std::vector<BusValue> items{};

  static BusValue Text(std::string text) { return {'s', {}, 0, std::move(text), {}}; }
  static BusValue Path(std::string path) { return {'o', {}, 0, std::move(path), {}}; }
  static BusValue Number(std::uint32_t number) { return {'u', {}, number, {}, {}}; }
  static BusValue Wide(std::uint64_t number) { return {'t', {}, number, {}, {}}; }
  static BusValue Signed(std::int64_t number) {
    return {'x', {}, static_cast<std::uint64_t>(number), {}, {}};
  }
  static BusValue Truth(bool truth) { return {'b', {}, truth ? 1U : 0U, {}, {}}; }
  static BusValue Array(std::string contents, std::vector<BusValue> items) {
    return {'a', std::move(contents), 0, {}, std::move(items)};
  }

  /// As it stands in messages.
  std::string Signature() const;
  bool IsText() const { return kind == 's' || kind == 'o' || kind == 'g'; }

  friend bool operator==(const BusValue&, const BusValue&) = default;
};

/// The next value of a message. Nothing at its end, and for what can't be kept (a descriptor, a value in
/// more than 16 others).
std::optional<BusValue> ReadValue(const BusLibrary& library, void* message, int depth = 0);
/// False for what the bus doesn't take, such as a text that isn't UTF-8.
bool AppendValue(const BusLibrary& library, void* message, const BusValue& value);

/// Texts by name: "a{ss}".
using TextMap = std::map<std::string, std::string>;
TextMap TextMapOf(const BusValue& value);
BusValue ValueOf(const TextMap& texts);

/// Values by name: "a{sv}", each as it is in its variant.
using ValueMap = std::map<std::string, BusValue>;
ValueMap ValueMapOf(const BusValue& value);
BusValue ValueOf(const ValueMap& values);

} // namespace quendra::platform::linux_

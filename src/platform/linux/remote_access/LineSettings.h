#pragma once

#include "platform/linux/network_manager/NetworkSettings.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>

namespace quendra::platform::linux_ {

/// The kinds of connections that are entries of the phone book.
enum class LineKind { Pppoe, Vpn };

/// Nothing for a connection of another kind.
std::optional<LineKind> LineKindOf(const NetworkSettings& settings);
/// What entries and devices of that kind are called: "pppoe", "vpn".
const char* DeviceTypeOf(LineKind kind);
std::optional<LineKind> LineKindOfDevice(std::string_view deviceType);

/// A text of NetworkManager's as a field of so many bytes shows it: in the code page, cut to leave room for
/// the NUL.
std::string Shown(const std::string& utf8, std::size_t fieldBytes);
/// The text for what a field shows now. One that the field can't show in full stays what it was as long as
/// the field shows the same.
std::string Kept(const std::string& before, const std::string& shown, std::size_t fieldBytes);

/// The text of a field, up to its NUL or its end.
std::string_view FieldText(std::span<const std::uint8_t> image, std::size_t at, std::size_t bytes);
/// Clears the field and puts what fits, with a NUL.
void PutFieldText(std::span<std::uint8_t> image, std::size_t at, std::size_t bytes, std::string_view text);

} // namespace quendra::platform::linux_

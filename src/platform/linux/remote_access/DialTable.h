#pragma once

#include <cstdint>
#include <optional>

namespace quendra::platform::linux_ {

/// Whether the kernel speaks PPP: NetworkManager doesn't tell a line that nobody answers from a machine that
/// can't ask.
enum class KernelPpp { Missing, There };

/// What NetworkManager's states mean to a dial; nothing for one that is no step of a dial.
std::optional<std::uint32_t> RasStateOfDevice(std::uint64_t deviceState);
std::optional<std::uint32_t> RasStateOfVpn(std::uint64_t vpnState);
/// The device has no line any more: its reason tells why.
bool EndsLine(std::uint64_t deviceState);

/// Why a line didn't come up, or dropped, as error numbers: of a device's reasons, of those of an active
/// connection, which are also a VPN's, and of the name of a refusal.
std::uint32_t RasErrorOfDevice(std::uint64_t reason, KernelPpp kernel);
std::uint32_t RasErrorOfActive(std::uint64_t reason, KernelPpp kernel);
/// The same for a line that stood.
std::uint32_t RasErrorOfDrop(std::uint32_t errorOfDial);

} // namespace quendra::platform::linux_

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

namespace quendra::provisioning {

enum class ConnectionKind { Pppoe, Vpn };

/// What kind of entry a modem is dialled by, and whether that is first made under a name for the time being.
struct Modem {
  ConnectionKind kind = ConnectionKind::Pppoe;
  bool viaTemporaryEntry = false;
};

/// In the order of the page's rows.
inline constexpr std::array<Modem, 5> kModems{{
    {ConnectionKind::Pppoe},
    {ConnectionKind::Pppoe},
    {ConnectionKind::Vpn},
    {ConnectionKind::Pppoe},
    {ConnectionKind::Pppoe, true},
}};

/// nullptr for a number that no modem has, -1 for none chosen among them.
inline const Modem* FindModem(std::int16_t number) {
  const auto place = static_cast<std::size_t>(number);
  return number >= 0 && place < kModems.size() ? &kModems[place] : nullptr;
}

} // namespace quendra::provisioning

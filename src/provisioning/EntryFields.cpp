#include "provisioning/EntryFields.h"

namespace quendra::provisioning {

namespace {

using Record = RasEntryRecord;

/// A field and its value for entries of either kind.
struct NumberField {
  std::uint32_t Record::*field;
  std::uint32_t pppoe;
  std::uint32_t vpn;
};
constexpr std::array<NumberField, 16> kNumbers{{
    {&Record::options, 0x0500021F, 0x7FBEFFFF},
    {&Record::countryId, 972, 972},
    {&Record::countryCode, 972, 972},
    {&Record::netProtocols, 4, 4},    // IP
    {&Record::framingProtocol, 1, 1}, // PPP
    {&Record::subEntries, 1, 1},
    {&Record::dialMode, 1, 1},
    {&Record::dialExtraPercent, 75, 75},
    {&Record::dialExtraSampleSeconds, 120, 120},
    {&Record::hangUpExtraPercent, 120, 120}, // settled so, although it repeats the seconds
    {&Record::hangUpExtraSampleSeconds, 0, 0},
    {&Record::idleDisconnectSeconds, 0, 0},
    {&Record::entryType, 5, 2}, // broadband, VPN
    {&Record::encryptionType, 3, 3},
    {&Record::customAuthenticationKey, 0, 0},
    {&Record::vpnStrategy, 0, 1},
}};
constexpr const char16_t* kVpnServer = u"10.0.0.138";

} // namespace

const char16_t* DeviceTypeOf(ConnectionKind kind) { return kind == ConnectionKind::Vpn ? u"vpn" : u"pppoe"; }

void FillEntry(RasEntryRecord& record, ConnectionKind kind) {
  const bool vpn = kind == ConnectionKind::Vpn;
  for (const NumberField& row : kNumbers) record.*row.field = vpn ? row.vpn : row.pppoe;
  record.localPhoneNumber = vpn ? kVpnServer : u"";
}

} // namespace quendra::provisioning

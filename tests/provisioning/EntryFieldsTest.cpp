#include "provisioning/EntryFields.h"

#include <gtest/gtest.h>

namespace quendra::provisioning {
namespace {

RasEntryRecord EntryOf(ConnectionKind kind) {
  RasEntryRecord record;
  FillEntry(record, kind);
  return record;
}

TEST(EntryFields, An_entry_for_pppoe_has_these_fields_and_no_others) {
  RasEntryRecord expected;
  expected.options = 0x0500021F;
  expected.countryId = 972;
  expected.countryCode = 972;
  expected.netProtocols = 4;
  expected.framingProtocol = 1;
  expected.subEntries = 1;
  expected.dialMode = 1;
  expected.dialExtraPercent = 75;
  expected.dialExtraSampleSeconds = 120;
  expected.hangUpExtraPercent = 120;
  expected.hangUpExtraSampleSeconds = 0;
  expected.idleDisconnectSeconds = 0;
  expected.entryType = 5;
  expected.encryptionType = 3;
  expected.customAuthenticationKey = 0;
  expected.vpnStrategy = 0;

  EXPECT_EQ(EntryOf(ConnectionKind::Pppoe), expected);
}

TEST(EntryFields, An_entry_for_a_vpn_has_other_options_another_type_its_strategy_and_its_server) {
  RasEntryRecord expected = EntryOf(ConnectionKind::Pppoe);
  expected.options = 0x7FBEFFFF;
  expected.localPhoneNumber = u"10.0.0.138";
  expected.entryType = 2;
  expected.vpnStrategy = 1;

  EXPECT_EQ(EntryOf(ConnectionKind::Vpn), expected);
}

TEST(EntryFields, Each_field_of_the_table_is_written_over) {
  RasEntryRecord vpn = EntryOf(ConnectionKind::Vpn);
  FillEntry(vpn, ConnectionKind::Pppoe);
  EXPECT_EQ(vpn, EntryOf(ConnectionKind::Pppoe));
}

TEST(EntryFields, The_device_types_are_the_texts_that_the_system_knows) {
  EXPECT_EQ(Text(DeviceTypeOf(ConnectionKind::Pppoe)), u"pppoe");
  EXPECT_EQ(Text(DeviceTypeOf(ConnectionKind::Vpn)), u"vpn");
}

} // namespace
} // namespace quendra::provisioning

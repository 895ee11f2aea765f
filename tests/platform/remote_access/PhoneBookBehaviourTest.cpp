#include "platform/remote_access/RemoteAccessBehaviour.h"

#include <algorithm>

namespace quendra::platform {
namespace {

// Entries.

TEST_P(RemoteAccessBehaviourTest, An_empty_phone_book_lists_nothing) {
  std::uint32_t bytes = 77;
  std::uint32_t count = 77;

  EXPECT_EQ(Book().RasEnumEntriesA(nullptr, {}, bytes, count), kRasSuccess);

  EXPECT_EQ(bytes, 0U);
  EXPECT_EQ(count, 0U);
}

TEST_P(RemoteAccessBehaviourTest, An_entry_that_is_made_is_listed_by_its_name) {
  EXPECT_EQ(Set("Home", BroadbandEntry()), kRasSuccess);
  EXPECT_EQ(Set("097", BroadbandEntry()), kRasSuccess);

  Lines names = Names();
  std::ranges::sort(names);
  EXPECT_EQ(names, (Lines{"097", "Home"}));
}

TEST_P(RemoteAccessBehaviourTest, A_name_may_be_Hebrew_and_hold_blanks) {
  EXPECT_EQ(Set("\xE1\xE9\xFA my home", BroadbandEntry()), kRasSuccess);

  EXPECT_EQ(Names(), Lines{"\xE1\xE9\xFA my home"});
}

TEST_P(RemoteAccessBehaviourTest, An_empty_phone_book_name_is_the_users_own) {
  Set("Home", BroadbandEntry());
  std::uint32_t bytes = 0;
  std::uint32_t count = 0;

  EXPECT_EQ(Book().RasEnumEntriesA("", {}, bytes, count), kRasBufferTooSmall);

  EXPECT_EQ(count, 1U);
  EXPECT_EQ(Book().RasDeleteEntryA("", "Home"), kRasSuccess);
  EXPECT_EQ(Names(), Lines());
}

TEST_P(RemoteAccessBehaviourTest, One_entry_fits_a_buffer_of_one_record_and_two_do_not) {
  Set("Home", BroadbandEntry());
  Bytes record = Record(RasEntryName::kBytes);
  std::uint32_t bytes = RasEntryName::kBytes;
  std::uint32_t count = 0;
  EXPECT_EQ(Book().RasEnumEntriesA(nullptr, record, bytes, count), kRasSuccess);
  EXPECT_EQ(count, 1U);

  Set("Other", BroadbandEntry());
  record = Record(RasEntryName::kBytes);
  bytes = RasEntryName::kBytes;
  EXPECT_EQ(Book().RasEnumEntriesA(nullptr, record, bytes, count), kRasBufferTooSmall);

  EXPECT_EQ(bytes, 2 * RasEntryName::kBytes);
}

TEST_P(RemoteAccessBehaviourTest, A_buffer_is_not_filled_beyond_its_end_whatever_the_caller_says_of_it) {
  Set("Home", BroadbandEntry());
  Set("Other", BroadbandEntry());
  Bytes records = Record(RasEntryName::kBytes);
  std::uint32_t bytes = 100 * RasEntryName::kBytes;
  std::uint32_t count = 0;

  EXPECT_EQ(Book().RasEnumEntriesA(nullptr, records, bytes, count), kRasBufferTooSmall);
}

TEST_P(RemoteAccessBehaviourTest, Records_of_another_size_are_refused) {
  Set("Home", BroadbandEntry());
  Bytes records = Record(RasEntryName::kBytes + 4);
  std::uint32_t bytes = RasEntryName::kBytes + 4;
  std::uint32_t count = 0;

  EXPECT_EQ(Book().RasEnumEntriesA(nullptr, records, bytes, count), kRasInvalidSize);

  Bytes entry = BroadbandEntry();
  PutLittle32(entry, 0, EntryBytes() + 4);
  EXPECT_EQ(Set("Other", entry), kRasInvalidSize);
  EXPECT_EQ(Names(), Lines{"Home"});
}

TEST_P(RemoteAccessBehaviourTest, An_entry_is_deleted_once_in_whatever_case_it_is_named) {
  Set("Home", BroadbandEntry());

  EXPECT_EQ(Book().RasDeleteEntryA(nullptr, "hOME"), kRasSuccess);

  EXPECT_EQ(Names(), Lines());
  EXPECT_EQ(Book().RasDeleteEntryA(nullptr, "Home"), kRasCannotFindPhonebookEntry);
}

TEST_P(RemoteAccessBehaviourTest, An_entry_is_written_over_in_whatever_case_it_is_named) {
  Set("Home", BroadbandEntry());
  Bytes entry = BroadbandEntry();
  PutLittle32(entry, RasEntry::kOptions, 0x051C0310);

  EXPECT_EQ(Set("HOME", entry), kRasSuccess);

  EXPECT_EQ(Names().size(), 1U);
  EXPECT_EQ(Read("home", entry), kRasSuccess);
  EXPECT_EQ(Little32(entry, RasEntry::kOptions), 0x051C0310U);
}

TEST_P(RemoteAccessBehaviourTest, An_entry_without_a_name_cannot_be_made) {
  EXPECT_NE(Set("", BroadbandEntry()), kRasSuccess);
  EXPECT_NE(Book().RasSetEntryPropertiesA(nullptr, nullptr, BroadbandEntry()), kRasSuccess);

  EXPECT_EQ(Names(), Lines());
}

TEST_P(RemoteAccessBehaviourTest, A_record_that_was_cut_makes_no_entry) {
  const Bytes whole = BroadbandEntry();
  for (const std::size_t size : {std::size_t{0}, std::size_t{3}, std::size_t{4}, whole.size() - 1})
    EXPECT_NE(Set("Home", Bytes(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size))),
              kRasSuccess)
        << size;

  EXPECT_EQ(Names(), Lines());
}

// Properties.

TEST_P(RemoteAccessBehaviourTest, The_record_of_an_entry_has_a_size_that_systems_have_had) {
  const std::uint32_t size = EntryBytes();

  EXPECT_TRUE(size == 1672 || size == 1768 || size == 1796 || size == 2088 || size == 2884) << size;
}

TEST_P(RemoteAccessBehaviourTest, A_missing_entry_has_no_properties) {
  Bytes entry;

  EXPECT_EQ(Read("Home", entry), kRasCannotFindPhonebookEntry);
}

TEST_P(RemoteAccessBehaviourTest, Every_number_of_an_entry_survives) {
  Bytes entry = BroadbandEntry();
  std::vector<std::size_t> numbers{
      RasEntry::kOptions,        RasEntry::kCountryId,      RasEntry::kCountryCode,
      RasEntry::kAddresses,      RasEntry::kAddresses + 4,  RasEntry::kAddresses + 8,
      RasEntry::kAddresses + 12, RasEntry::kAddresses + 16, RasEntry::kFrameSize,
      RasEntry::kNetProtocols,   RasEntry::kFramingProtocol};
  if (entry.size() > RasEntry::kBytesWithoutSubEntries)
    for (std::size_t at = RasEntry::kSubEntries; at <= RasEntry::kIdleDisconnectSeconds; at += 4)
      numbers.push_back(at);
  if (entry.size() > RasEntry::kBytesWithoutEntryType)
    for (const std::size_t at : {RasEntry::kEncryptionType, RasEntry::kCustomAuthKey, RasEntry::kGuid,
                                 RasEntry::kGuid + 12, RasEntry::kVpnStrategy})
      numbers.push_back(at);
  for (const std::size_t at : numbers) PutLittle32(entry, at, static_cast<std::uint32_t>(0x01000000 + at));
  ASSERT_EQ(Set("Home", entry), kRasSuccess);
  Bytes read;
  ASSERT_EQ(Read("Home", read), kRasSuccess);

  for (const std::size_t at : numbers) EXPECT_EQ(Little32(read, at), 0x01000000 + at) << at;
}

TEST_P(RemoteAccessBehaviourTest, Every_text_of_an_entry_survives) {
  Bytes entry = BroadbandEntry();
  std::map<std::size_t, std::string> texts{{RasEntry::kAreaCode, "04"},
                                           {RasEntry::kLocalPhoneNumber, "10.0.0.138"},
                                           {RasEntry::kScript, "C:\\\xE1\xE9\xFA.scp"},
                                           {RasEntry::kAutodialLibrary, "C:\\a.dll"},
                                           {RasEntry::kAutodialFunction, "Dial"}};
  if (entry.size() > RasEntry::kBytesWithoutEntryType) texts[RasEntry::kCustomDialLibrary] = "C:\\b.dll";
  for (const auto& [at, text] : texts) Put(entry, at, text);
  ASSERT_EQ(Set("Home", entry), kRasSuccess);
  Bytes read;
  ASSERT_EQ(Read("Home", read), kRasSuccess);

  for (const auto& [at, text] : texts) EXPECT_EQ(Get(read, at), text) << at;
  EXPECT_EQ(Get(read, RasEntry::kDeviceType), "pppoe");
  EXPECT_EQ(Get(read, RasEntry::kDeviceName), Devices().at("pppoe"));
}

TEST_P(RemoteAccessBehaviourTest, Alternate_numbers_come_behind_the_record) {
  const std::uint32_t size = EntryBytes();
  Bytes entry = BroadbandEntry();
  PutLittle32(entry, RasEntry::kAlternateOffset, size);
  for (const char sign : std::string("111\0"
                                     "222\0\0",
                                     9))
    entry.push_back(static_cast<std::uint8_t>(sign));
  ASSERT_EQ(Set("Home", entry), kRasSuccess);
  Bytes read;
  ASSERT_EQ(Read("Home", read), kRasSuccess);

  const std::uint32_t offset = Little32(read, RasEntry::kAlternateOffset);
  ASSERT_GE(offset, size);
  ASSERT_LT(offset + 4, read.size());
  EXPECT_EQ(Get(read, offset), "111");
  EXPECT_EQ(Get(read, offset + 4), "222");
}

TEST_P(RemoteAccessBehaviourTest, An_offset_of_alternate_numbers_outside_the_record_is_none) {
  for (const std::uint32_t offset : {0x7FFFFFFFU, 0xFFFFFFFFU}) {
    Bytes entry = BroadbandEntry();
    PutLittle32(entry, RasEntry::kAlternateOffset, offset);
    EXPECT_EQ(Set("Home", entry), kRasSuccess);
    EXPECT_EQ(Read("Home", entry), kRasSuccess);
    EXPECT_EQ(Little32(entry, RasEntry::kAlternateOffset), 0U);
  }
}

TEST_P(RemoteAccessBehaviourTest, An_entry_that_is_read_and_written_is_the_same_entry) {
  Bytes entry = BroadbandEntry();
  PutLittle32(entry, RasEntry::kOptions, 0x0500021F);
  Set("Home", entry);
  Bytes first;
  Bytes second;

  ASSERT_EQ(Read("Home", first), kRasSuccess);
  ASSERT_EQ(Set("Copy", first), kRasSuccess);
  ASSERT_EQ(Read("Copy", second), kRasSuccess);

  EXPECT_EQ(first, second);
}

// What is saved for dials.

TEST_P(RemoteAccessBehaviourTest, A_user_name_and_a_password_are_kept_with_the_entry) {
  Set("Home", BroadbandEntry());
  EXPECT_EQ(Book().RasSetEntryDialParamsA(nullptr, Params("Home", "user@097", "secret"), false), kRasSuccess);
  Bytes params = Params("Home");
  bool hasPassword = false;

  EXPECT_EQ(Book().RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasSuccess);

  EXPECT_TRUE(hasPassword);
  EXPECT_EQ(Get(params, kUserName), "user@097");
  EXPECT_EQ(Get(params, kPassword), "secret");
}

TEST_P(RemoteAccessBehaviourTest, What_is_saved_stays_when_the_entry_is_written_over) {
  Set("Home", BroadbandEntry());
  Book().RasSetEntryDialParamsA(nullptr, Params("Home", "user@097", "secret"), false);

  Set("Home", BroadbandEntry());

  Bytes params = Params("Home");
  bool hasPassword = false;
  EXPECT_EQ(Book().RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasSuccess);
  EXPECT_EQ(Get(params, kPassword), "secret");
}

TEST_P(RemoteAccessBehaviourTest, A_password_is_removed_by_the_flag_alone) {
  Set("Home", BroadbandEntry());
  Book().RasSetEntryDialParamsA(nullptr, Params("Home", "user@097", "secret"), false);

  EXPECT_EQ(Book().RasSetEntryDialParamsA(nullptr, Params("Home", "user@097", "secret"), true), kRasSuccess);

  Bytes params = Params("Home");
  bool hasPassword = true;
  EXPECT_EQ(Book().RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasSuccess);
  EXPECT_FALSE(hasPassword);
  EXPECT_EQ(Get(params, kPassword), "");
  EXPECT_EQ(Get(params, kUserName), "user@097");
}

TEST_P(RemoteAccessBehaviourTest, A_missing_entry_and_an_empty_name_have_nothing_saved) {
  bool hasPassword = true;
  for (const char* name : {"", "Home"}) {
    Bytes params = Params(name);
    EXPECT_EQ(Book().RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasCannotFindPhonebookEntry);
    EXPECT_FALSE(hasPassword);
    EXPECT_EQ(Book().RasSetEntryDialParamsA(nullptr, params, false), kRasCannotFindPhonebookEntry);
  }
}

TEST_P(RemoteAccessBehaviourTest, Every_accepted_size_of_what_is_saved_has_its_own_places) {
  Set("Home", BroadbandEntry());
  Book().RasSetEntryDialParamsA(nullptr, Params("Home", "user@097", "secret"), false);
  int accepted = 0;
  for (const std::uint32_t size : {1060U, 1052U, 816U}) {
    Bytes params = Record(size);
    bool hasPassword = false;
    if (Book().RasGetEntryDialParamsA(nullptr, params, hasPassword) != kRasCannotFindPhonebookEntry) continue;
    ++accepted;
    Put(params, RasDialParams::kEntryName, "Home");
    EXPECT_EQ(Book().RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasSuccess) << size;
    EXPECT_EQ(Get(params, size == 816 ? kUserName - 236 : kUserName), "user@097") << size;
  }
  EXPECT_GE(accepted, 1);
}

TEST_P(RemoteAccessBehaviourTest, Dial_parameters_of_another_size_are_refused) {
  bool hasPassword = true;
  for (const std::uint32_t size : {4U, 815U, 1056U, 5000U}) {
    Bytes params = Record(size);
    EXPECT_EQ(Book().RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasInvalidSize) << size;
    EXPECT_EQ(Book().RasSetEntryDialParamsA(nullptr, params, false), kRasInvalidSize) << size;
  }
  EXPECT_FALSE(hasPassword);
}

TEST_P(RemoteAccessBehaviourTest, Dial_parameters_that_were_cut_are_refused) {
  Set("Home", BroadbandEntry());
  const Bytes whole = Params("Home", "user", "secret");
  bool hasPassword = false;
  for (const std::size_t size : {std::size_t{0}, std::size_t{3}, std::size_t{4}, whole.size() - 1}) {
    Bytes params(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size));
    EXPECT_NE(Book().RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasSuccess) << size;
    EXPECT_NE(Book().RasSetEntryDialParamsA(nullptr, params, false), kRasSuccess) << size;
  }
}

// Devices.

TEST_P(RemoteAccessBehaviourTest, Devices_are_listed_with_type_and_name) {
  const auto devices = Devices();

  ASSERT_TRUE(devices.contains("pppoe"));
  for (const auto& [type, name] : devices) EXPECT_NE(name, "") << type;
}

TEST_P(RemoteAccessBehaviourTest, Devices_in_records_of_another_size_are_refused) {
  std::uint32_t bytes = 0;
  std::uint32_t count = 0;
  EXPECT_EQ(Book().RasEnumDevicesA({}, bytes, count), kRasBufferTooSmall);
  Bytes records(bytes);
  PutLittle32(records, 0, RasDeviceInfo::kBytes - 4);

  EXPECT_EQ(Book().RasEnumDevicesA(records, bytes, count), kRasInvalidSize);
}

} // namespace
} // namespace quendra::platform

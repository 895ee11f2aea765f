#include "provisioning/remote_access/MdlDunFixture.h"

namespace quendra::provisioning {
namespace {

using platform::RasEntry;

struct MdlDunEntries : MdlDunFixture {
  std::vector<Text> names{u"before"};
  std::int32_t count = 77;
};

// Listing.

TEST_F(MdlDunEntries, A_phone_book_of_several_entries_is_listed_in_its_order) {
  for (const char* name : {"Home", "097", "\xE1\xE9\xFA"}) ras.AddEntry(name);

  EXPECT_EQ(dun.EnumEntries(names, count, none), kTrue16);

  EXPECT_EQ(names, (std::vector<Text>{u"Home", u"097", u"\u05d1\u05d9\u05ea"}));
  EXPECT_EQ(count, 3);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunEntries, An_empty_phone_book_is_told_and_fails) {
  EXPECT_EQ(dun.EnumEntries(names, count, none), kFalse16);

  ExpectOneBox(ExclamationBox(u"  No Entries To List", u"There are no Dial-Up entries on this system."));
  EXPECT_TRUE(names.empty());
  EXPECT_EQ(count, 0);
}

TEST_F(MdlDunEntries, A_phone_book_of_one_entry_is_told_as_empty) {
  ras.AddEntry("Home");

  EXPECT_EQ(dun.EnumEntries(names, count, none), kFalse16);

  ExpectOneBox(ExclamationBox(u"  No Entries To List", u"There are no Dial-Up entries on this system."));
  EXPECT_TRUE(names.empty());
}

TEST_F(MdlDunEntries, A_first_question_that_fails_is_told_and_the_listing_fails) {
  ras.Refuse("RasEnumEntriesA", 711);

  EXPECT_EQ(dun.EnumEntries(names, count, none), kFalse16);

  ExpectOneBox(RasErrorBox(u"RasEnumEntries", u"711", u"Remote access could not start."));
}

TEST_F(MdlDunEntries, A_second_question_that_fails_is_told_and_the_listing_succeeds_with_nothing) {
  ras.AddEntry("Home");
  ras.AddEntry("Other");
  ras.Refuse("RasEnumEntriesA", 5, 1);

  EXPECT_EQ(dun.EnumEntries(names, count, none), kTrue16);

  ExpectOneBox(RasErrorBox(u"RasEnumEntries", u"5", u"Access is denied.\r\n"));
  EXPECT_TRUE(names.empty());
  EXPECT_EQ(count, 0);
}

TEST_F(MdlDunEntries, A_thousand_entries_are_listed) {
  for (int i = 0; i < 1000; ++i) ras.AddEntry("Entry " + std::to_string(i));

  EXPECT_EQ(dun.EnumEntries(names, count, none), kTrue16);

  EXPECT_EQ(count, 1000);
  EXPECT_EQ(names.back(), u"Entry 999");
}

// The phone book.

TEST_F(MdlDunEntries, A_named_phone_book_gets_a_NUL_and_goes_to_the_system) {
  dun.EnumEntries(names, count, book);

  EXPECT_EQ(book, Text(u"C:\\a.pbk\0", 9));
  EXPECT_EQ(ras.PhoneBookOf["RasEnumEntriesA"], "C:\\a.pbk");
  dun.EnumEntries(names, count, book);
  EXPECT_EQ(book.size(), 9U) << "which has one already";
}

TEST_F(MdlDunEntries, No_phone_book_is_an_empty_text) {
  dun.EnumEntries(names, count, none);
  dun.DeleteEntry(home, otherNone, kFalse16);
  dun.GetEntryProperties(entry, home, none);
  EXPECT_EQ(ras.PhoneBookOf["RasGetEntryPropertiesA"], "");
  dun.SetEntryProperties(home, entry, params, none);

  EXPECT_EQ(none, u"");
  for (const char* operation : {"RasEnumEntriesA", "RasDeleteEntryA", "RasSetEntryPropertiesA"})
    EXPECT_EQ(ras.PhoneBookOf[operation], "") << operation;
}

TEST_F(MdlDunEntries, A_system_that_has_no_named_phone_books_is_given_none) {
  for (const std::uint32_t minor : {0U, 10U}) {
    machine.system.Version = {1, 4, minor, 0};
    Text named = u"C:\\a.pbk";
    dun.DeleteEntry(home, named, kFalse16);
    EXPECT_EQ(named, u"") << minor;
    EXPECT_EQ(ras.PhoneBookOf["RasDeleteEntryA"], "") << minor;
  }
}

TEST_F(MdlDunEntries, A_system_of_any_other_version_is_given_the_named_phone_book) {
  for (const auto& version : {platform::OsVersion{1, 4, 90, 0}, platform::OsVersion{2, 4, 0, 0},
                              platform::OsVersion{2, 5, 0, 0}, platform::OsVersion{0, 0, 0, 0}}) {
    machine.system.Version = version;
    dun.DeleteEntry(home, book, kFalse16);
    EXPECT_EQ(ras.PhoneBookOf["RasDeleteEntryA"], "C:\\a.pbk") << version.platformId;
  }
}

TEST_F(MdlDunEntries, A_system_that_tells_no_version_is_given_no_phone_book_and_says_so) {
  machine.system.FailVersion = true;

  dun.DeleteEntry(home, book, kFalse16);

  EXPECT_EQ(ras.PhoneBookOf["RasDeleteEntryA"], "");
  ExpectOneBox(ExclamationBox(u"  Error Getting OS Information",
                              u"An error occured while trying to get the OS version and information.\r"
                              u"Click OK to continue."));
}

TEST_F(MdlDunEntries, The_version_is_not_asked_for_without_a_phone_book) {
  machine.system.FailVersion = true;

  dun.DeleteEntry(home, none, kFalse16);

  EXPECT_TRUE(desktop.Boxes.empty());
}

// Deleting.

TEST_F(MdlDunEntries, An_entry_is_deleted) {
  ras.AddEntry("Home");

  EXPECT_EQ(dun.DeleteEntry(home, none, kTrue16), kTrue16);

  EXPECT_TRUE(ras.EntryNames().empty());
  EXPECT_EQ(home, Text(u"Home\0", 5));
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunEntries, A_missing_entry_is_told_when_it_is_to_be_shown) {
  EXPECT_EQ(dun.DeleteEntry(home, none, kTrue16), kFalse16);

  ExpectOneBox(RasErrorBox(u"RasDeleteEntry", u"623", u"The phone book entry was not found."));
}

TEST_F(MdlDunEntries, A_missing_entry_is_not_told_otherwise) {
  EXPECT_EQ(dun.DeleteEntry(home, none, kFalse16), kFalse16);

  EXPECT_TRUE(desktop.Boxes.empty());
}

// Properties.

TEST_F(MdlDunEntries, A_full_entry_survives_being_written_and_read) {
  EXPECT_EQ(dun.SetEntryProperties(home, FullEntry(), params, none), kTrue16);
  EXPECT_EQ(dun.GetEntryProperties(entry, home, none), kTrue16);

  RasEntryRecord expected = FullEntry();
  expected.alternateNumbers = Text(u"111\0\0", 5);
  EXPECT_EQ(entry, expected);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(MdlDunEntries, Alternate_numbers_grow_by_nothing_each_time) {
  Text copy = u"Copy";
  dun.SetEntryProperties(home, FullEntry(), params, none);
  dun.GetEntryProperties(entry, home, none);
  dun.SetEntryProperties(copy, entry, params, none);
  RasEntryRecord again;

  dun.GetEntryProperties(again, copy, none);

  EXPECT_EQ(again, entry);
}

TEST_F(MdlDunEntries, An_entry_of_a_system_with_a_short_record_leaves_the_other_fields_cleared) {
  ras.EntryBytes = RasEntry::kBytesOfShortDeviceNames;
  entry = FullEntry();
  dun.SetEntryProperties(home, FullEntry(), params, none);

  EXPECT_EQ(dun.GetEntryProperties(entry, home, none), kTrue16);

  EXPECT_EQ(entry.channels, 2U);
  EXPECT_EQ(entry.deviceName, FullEntry().deviceName);
  EXPECT_EQ(entry.subEntries, 0U);
  EXPECT_EQ(entry.guid, RasEntryRecord().guid);
  EXPECT_EQ(entry.vpnStrategy, 0U);
}

TEST_F(MdlDunEntries, The_name_of_an_entry_that_is_read_gets_a_NUL) {
  dun.GetEntryProperties(entry, home, none);

  EXPECT_EQ(home, Text(u"Home\0", 5));
}

TEST_F(MdlDunEntries, A_missing_entry_is_cleared_and_told) {
  entry = FullEntry();

  EXPECT_EQ(dun.GetEntryProperties(entry, home, none), kFalse16);

  EXPECT_EQ(entry, RasEntryRecord());
  ExpectOneBox(RasErrorBox(u"RasGetEntryProperties", u"623", u"The phone book entry was not found."));
}

TEST_F(MdlDunEntries, An_entry_that_goes_between_two_questions_is_told) {
  ras.AddEntry("Home");
  ras.Refuse("RasGetEntryPropertiesA", 623, 2);

  EXPECT_EQ(dun.GetEntryProperties(entry, home, none), kFalse16);

  ExpectOneBox(RasErrorBox(u"RasGetEntryProperties", u"623", u"The phone book entry was not found."));
}

TEST_F(MdlDunEntries, A_record_whose_size_is_not_told_cannot_be_written) {
  ras.Refuse("RasGetEntryPropertiesA", 711);

  EXPECT_EQ(dun.SetEntryProperties(home, entry, params, none), kFalse16);

  ExpectOneBox(RasErrorBox(u"RasGetEntryProperties", u"711", u"Remote access could not start."));
  EXPECT_EQ(ras.Count("RasSetEntryPropertiesA"), 0);
}

TEST_F(MdlDunEntries, An_entry_that_the_system_refuses_is_told) {
  ras.Refuse("RasSetEntryPropertiesA", 5);

  EXPECT_EQ(dun.SetEntryProperties(home, entry, params, none), kFalse16);

  ExpectOneBox(RasErrorBox(u"RasSetEntryProperties", u"5", u"Access is denied.\r\n"));
  EXPECT_EQ(ras.Count("RasSetEntryDialParamsA"), 0);
}

TEST_F(MdlDunEntries, An_entry_is_written_over) {
  dun.SetEntryProperties(home, FullEntry(), params, none);
  entry.options = 5;

  dun.SetEntryProperties(home, entry, params, none);

  EXPECT_EQ(ras.EntryNames(), Lines{"Home"});
  EXPECT_EQ(ras.Entry("Home")->Number(RasEntry::kOptions), 5U);
  EXPECT_EQ(ras.Entry("Home")->DeviceType(), "");
}

// What is saved for dials with an entry.

TEST_F(MdlDunEntries, What_is_dialled_with_is_saved_with_the_entry) {
  params = FullDialParams();
  params.entryName = u"Other";

  EXPECT_EQ(dun.SetEntryProperties(home, entry, params, none), kTrue16);

  EXPECT_EQ(ras.Entry("Home")->userName, "user@097");
  EXPECT_EQ(ras.Entry("Home")->password, "secret");
  EXPECT_EQ(ras.Entry("Home")->phoneNumber, "10.0.0.138");
  EXPECT_EQ(ras.Entry("Home")->domain, "domain");
  EXPECT_EQ(ras.Entry("Home")->callbackId, 12U);
  EXPECT_EQ(ras.PhoneBookOf["RasSetEntryDialParamsA"], "");
  EXPECT_EQ(params.entryName, u"Home");
  EXPECT_EQ(params.size, 1060U);
}

TEST_F(MdlDunEntries, A_text_with_a_blank_is_saved_up_to_it) {
  params = {
      .phoneNumber = u"03 123", .callbackNumber = u"1 2", .userName = u"my name", .password = u" secret"};

  dun.SetEntryProperties(home, entry, params, none);

  EXPECT_EQ(ras.Entry("Home")->userName, "my");
  EXPECT_EQ(ras.Entry("Home")->password, "");
  EXPECT_EQ(ras.Entry("Home")->phoneNumber, "03");
  EXPECT_EQ(ras.Entry("Home")->callbackNumber, "1 2");
  EXPECT_EQ(params.userName, Text(u"my\0name", 7));
}

TEST_F(MdlDunEntries, An_entry_whose_name_holds_a_blank_is_made_but_not_found_for_what_is_saved) {
  Text blank = u"My home";

  EXPECT_EQ(dun.SetEntryProperties(blank, entry, params, none), kFalse16);

  EXPECT_EQ(ras.EntryNames(), Lines{"My home"});
  ExpectOneBox(RasErrorBox(u"SetEntryDialParams", u"623", u"The phone book entry was not found."));
}

TEST_F(MdlDunEntries, What_cannot_be_saved_is_told_under_its_own_name) {
  ras.Refuse("RasSetEntryDialParamsA", 600);
  machine.system.MessageTexts[600] = "An operation is pending.";

  EXPECT_EQ(dun.SetEntryProperties(home, entry, params, none), kFalse16);

  ExpectOneBox(RasErrorBox(u"SetEntryDialParams", u"600", u"An operation is pending."));
}

TEST_F(MdlDunEntries, A_system_that_knows_no_size_of_what_is_saved_makes_it_fail_without_a_box) {
  ras.DialParamsSizes = {};

  EXPECT_EQ(dun.SetEntryProperties(home, entry, params, none), kFalse16);

  EXPECT_TRUE(desktop.Boxes.empty());
  EXPECT_EQ(ras.EntryNames(), Lines{"Home"});
  EXPECT_EQ(ras.Count("RasSetEntryDialParamsA"), 0);
}

TEST_F(MdlDunEntries, Clearing_a_record_empties_every_field) {
  entry = FullEntry();

  EXPECT_EQ(&ClearRasEntry(entry), &entry);

  EXPECT_EQ(entry, RasEntryRecord());
}

} // namespace
} // namespace quendra::provisioning

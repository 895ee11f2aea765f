#include "forms/headless/HeadlessDesktop.h"
#include "platform/unavailable/UnavailableDialling.h"
#include "platform/unavailable/UnavailablePhoneBook.h"
#include "provisioning/remote_access/MdlDunFixture.h"

#include <algorithm>

namespace quendra::provisioning {
namespace {

/// A phone book and dials that say what the test makes them say, whatever is true: sizes, counts, and bytes
/// that fill the buffers.
struct Lying : platform::unavailable::UnavailablePhoneBook, platform::unavailable::UnavailableDialling {
  struct Answer {
    std::uint32_t result = 0;
    std::uint32_t bytes = 0;
    std::uint32_t count = 0;
  };
  std::vector<Answer> answers;
  std::size_t asked = 0;
  std::uint8_t filler = 'x';
  int hangUps = 0;

  std::uint32_t Next(std::span<std::uint8_t> buffer, std::uint32_t& bytes, std::uint32_t* count) {
    const Answer answer = answers.at(std::min(asked++, answers.size() - 1));
    std::ranges::fill(buffer, filler);
    bytes = answer.bytes;
    if (count) *count = answer.count;
    return answer.result;
  }
  std::uint32_t RasEnumEntriesA(const char*, std::span<std::uint8_t> names, std::uint32_t& bytes,
                                std::uint32_t& count) override {
    return Next(names, bytes, &count);
  }
  std::uint32_t RasGetEntryPropertiesA(const char*, const char*, std::span<std::uint8_t> entry,
                                       std::uint32_t& bytes) override {
    return Next(entry, bytes, nullptr);
  }
  std::uint32_t RasEnumDevicesA(std::span<std::uint8_t> devices, std::uint32_t& bytes,
                                std::uint32_t& count) override {
    return Next(devices, bytes, &count);
  }
  std::uint32_t RasEnumConnectionsA(std::span<std::uint8_t> connections, std::uint32_t& bytes,
                                    std::uint32_t& count) override {
    return Next(connections, bytes, &count);
  }
  std::uint32_t RasHangUpA(platform::RasConnection) override {
    ++hangUps;
    return 0;
  }
  std::uint32_t RasGetErrorStringA(std::uint32_t, std::span<char> text) override {
    std::ranges::fill(text, 'x');
    return 0;
  }
};

struct HostilePlatform : testing::Test {
  Lying lying;
  platform::simulated::SimulatedMachine machine;
  forms::headless::HeadlessDesktop desktop;
  mdlDun dun{{lying, lying}, machine.system, desktop};
  std::vector<Text> names;
  std::int32_t count = 0;
  Text home = u"Home";
  Text none;
  RasEntryRecord entry;
  RasDialParamsRecord params;
};

TEST_F(HostilePlatform, A_count_of_entries_beyond_the_block_ends_with_it) {
  lying.answers = {{603, 600, 0}, {0, 600, 0xFFFFFFFF}};

  EXPECT_EQ(dun.EnumEntries(names, count, none), kTrue16);

  EXPECT_EQ(count, 2);
  EXPECT_EQ(names[1], Text(257, u'x'));
}

TEST_F(HostilePlatform, Entries_that_went_between_two_questions_are_not_listed) {
  lying.answers = {{603, 792, 3}, {0, 264, 1}};

  EXPECT_EQ(dun.EnumEntries(names, count, none), kTrue16);

  EXPECT_EQ(names.size(), 1U);
  EXPECT_EQ(count, 1);
}

TEST_F(HostilePlatform, A_size_of_entries_without_measure_is_told_as_a_want_of_memory) {
  lying.answers = {{603, 0xFFFFFFFF, 0}};

  EXPECT_EQ(dun.EnumEntries(names, count, none), kFalse16);

  EXPECT_EQ(desktop.Boxes, Boxes{FaultBox(u"EnumEntries", u"7", u"Out of memory")});
}

TEST_F(HostilePlatform, A_size_of_entries_below_one_record_is_told_as_a_fault) {
  lying.answers = {{603, 100, 0}};

  EXPECT_EQ(dun.EnumEntries(names, count, none), kFalse16);

  EXPECT_EQ(desktop.Boxes, Boxes{FaultBox(u"EnumEntries", u"9", u"Subscript out of range")});
}

TEST_F(HostilePlatform, A_size_of_an_entry_without_measure_is_told_as_a_want_of_memory) {
  lying.answers = {{603, 0xFFFFFFF0, 0}};

  EXPECT_EQ(dun.GetEntryProperties(entry, home, none), kFalse16);
  EXPECT_EQ(dun.SetEntryProperties(home, entry, params, none), kFalse16);

  EXPECT_EQ(desktop.Boxes, (Boxes{FaultBox(u"GetEntryProperties", u"7", u"Out of memory"),
                                  FaultBox(u"SetEntryProperties", u"7", u"Out of memory")}));
}

TEST_F(HostilePlatform, A_size_of_an_entry_without_room_for_itself_is_told_as_a_fault) {
  lying.answers = {{603, 3, 0}};

  EXPECT_EQ(dun.GetEntryProperties(entry, home, none), kFalse16);
  EXPECT_EQ(dun.SetEntryProperties(home, entry, params, none), kFalse16);

  EXPECT_EQ(desktop.Boxes, (Boxes{FaultBox(u"GetEntryProperties", u"9", u"Subscript out of range"),
                                  FaultBox(u"SetEntryProperties", u"9", u"Subscript out of range")}));
}

TEST_F(HostilePlatform, An_entry_without_NULs_and_with_an_offset_outside_is_read_within_its_fields) {
  lying.answers = {{603, 2088, 0}, {603, 2088, 0}, {0, 2088, 0}};

  EXPECT_EQ(dun.GetEntryProperties(entry, home, none), kTrue16);

  EXPECT_EQ(entry.deviceName, Text(129, u'x'));
  EXPECT_EQ(entry.alternateNumbers, u"");
}

TEST_F(HostilePlatform, An_entry_shorter_than_its_record_gives_the_fields_that_are_there) {
  lying.answers = {{603, 2088, 0}, {603, 1000, 0}, {0, 1000, 0}};

  EXPECT_EQ(dun.GetEntryProperties(entry, home, none), kTrue16);

  EXPECT_EQ(entry.deviceType, Text(17, u'x'));
  EXPECT_EQ(entry.deviceName, u"");
  EXPECT_EQ(entry.entryType, 0U);
}

TEST_F(HostilePlatform, A_count_of_devices_beyond_the_block_ends_with_it) {
  lying.answers = {{603, 320, 0xFFFFFFFF}};
  lying.answers.push_back({0, 320, 0xFFFFFFFF});

  EXPECT_EQ(dun.FindDeviceName(u"y"), u"");
  lying.asked = 0;
  EXPECT_EQ(dun.FindDeviceName(u"x"), Text(129, u'x'));
}

TEST_F(HostilePlatform, A_size_of_devices_without_measure_is_no_device) {
  for (const std::uint32_t bytes : {0xFFFFFFFFU, 0U, 3U, 151U}) {
    lying.answers = {{603, bytes, 1}, {0, bytes, 1}};
    lying.asked = 0;
    EXPECT_EQ(dun.FindDeviceName(u"x"), u"") << bytes;
  }
}

TEST_F(HostilePlatform, A_count_of_connections_without_measure_hangs_up_none) {
  lying.answers = {{603, 4, 0xFFFFFFFF}};

  EXPECT_EQ(dun.HangUpAllConnections(), kFalse16);

  EXPECT_EQ(lying.hangUps, 0);
}

TEST_F(HostilePlatform, More_connections_in_the_second_answer_than_there_is_room_for_end_with_the_room) {
  lying.answers = {{603, 4, 2}, {0, 4, 1000}};

  EXPECT_EQ(dun.HangUpAllConnections(), kTrue16);

  EXPECT_EQ(lying.hangUps, 2);
}

TEST_F(HostilePlatform, A_text_of_an_error_without_a_NUL_is_as_long_as_its_buffer) {
  dun.ReportRasError(691, u"RasDial", kTrue16);

  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_TRUE(desktop.Boxes[0].text.ends_with(u"= " + Text(512, u'x')));
}

} // namespace
} // namespace quendra::provisioning

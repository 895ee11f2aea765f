#include "platform/simulated/SimulatedMachine.h"
#include "platform/windows/remote_access/StandInRemoteAccess.h"
#include "provisioning/remote_access/FullRecords.h"
#include "provisioning/remote_access/RasEntryImage.h"
#include "provisioning/remote_access/mdlDun.h"

#include <gtest/gtest.h>

#include <array>
#include <utility>

namespace quendra::provisioning {
namespace {

using Told = std::vector<std::pair<std::uint32_t, std::uint32_t>>;

/// The module over remote access of Windows, whose records are of XP's sizes.
struct MdlDunOnWindows : testing::Test {
  MdlDunOnWindows() {
    dun.OnDialEvent = [this](auto, auto state, auto error) { told.push_back({state, error}); };
  }
  void Make(Text name, const RasEntryRecord& record = FullEntry()) {
    auto params = FullDialParams();
    ASSERT_EQ(dun.SetEntryProperties(name, record, params, none), kTrue16);
  }
  WindowHandle Window() {
    using Procedure = forms::WindowProcedure::element_type;
    return ras.Desktop.Windows.Add(std::make_shared<Procedure>([](auto...) { return 0; }));
  }

  platform::windows::StandInRemoteAccess ras{"097: 0 1 5 691; *: 0 8192"};
  platform::simulated::SimulatedMachine machine{ras.Desktop};
  mdlDun dun{{ras.Book, ras.Dials}, machine.system, ras.Desktop};
  Told told;
  Text none;
};

TEST_F(MdlDunOnWindows, Every_field_of_an_entry_comes_back_from_a_longer_record) {
  Make(u"Home");
  RasEntryRecord read;
  Text name = u"Home";

  ASSERT_EQ(dun.GetEntryProperties(read, name, none), kTrue16);

  // The system ends the list of numbers as it is published to end.
  RasEntryRecord expected = FullEntry();
  expected.alternateNumbers += TextView(u"\0\0", 2);
  EXPECT_EQ(read.alternateNumbers, expected.alternateNumbers);
  read.alternateNumbers = expected.alternateNumbers = {};
  EXPECT_EQ(RasEntryImageOf(read, platform::RasEntry::kBytes),
            RasEntryImageOf(expected, platform::RasEntry::kBytes));
}

TEST_F(MdlDunOnWindows, What_is_saved_for_dials_comes_back) {
  Make(u"Home");
  std::vector<std::uint8_t> image;
  Text name = u"Home";
  Boolean16 hasPassword = kFalse16;
  RasDialParamsRecord read;

  EXPECT_EQ(dun.GetDialParamsBytes(image, none, name, hasPassword), 0U);
  EXPECT_EQ(dun.DialParamsFromBytes(image, read), kTrue16);

  EXPECT_EQ(hasPassword, kTrue16);
  EXPECT_EQ(read.userName, u"user@097");
  EXPECT_EQ(read.password, u"secret");
}

TEST_F(MdlDunOnWindows, Entries_are_listed_with_Hebrew_names_and_deleted) {
  Make(u"\u05D1\u05D9\u05EA");
  Make(u"097");
  std::vector<Text> names;
  std::int32_t count = 0;

  EXPECT_EQ(dun.EnumEntries(names, count, none), kTrue16);

  EXPECT_EQ(count, 2);
  EXPECT_EQ(names, (std::vector<Text>{u"\u05D1\u05D9\u05EA", u"097"}));
  for (Text& name : names) EXPECT_EQ(dun.DeleteEntry(name, none, kTrue16), kTrue16);
  EXPECT_TRUE(ras.Desktop.Boxes.empty());
}

TEST_F(MdlDunOnWindows, A_device_is_found_by_its_type) {
  EXPECT_EQ(dun.FindDeviceName(u"pppoe", kTrue16), u"pppoe");
  EXPECT_EQ(dun.FindDeviceName(u"isdn", kTrue16), u"");
}

TEST_F(MdlDunOnWindows, A_dial_tells_its_states_and_its_error_through_the_hooked_window) {
  Make(u"097");
  Text name = u"097";

  dun.DialEntry(kTrue16, name, none, none, none, Window());

  ASSERT_TRUE(ras.Until([this] { return told.size() >= 4; }));
  EXPECT_EQ(told, (Told{{0, 0}, {1, 0}, {5, 0}, {5, 691}}));
  EXPECT_EQ(dun.HangUpActive(kTrue16), kTrue16);
  EXPECT_EQ(dun.ActiveRasConn, platform::kNoRasConnection);
  EXPECT_TRUE(ras.Desktop.Boxes.empty());
}

TEST_F(MdlDunOnWindows, All_connections_are_hung_up) {
  Make(u"One");
  Make(u"Two");
  for (Text name : {u"One", u"Two"}) {
    dun.DialEntry(kFalse16, name, none, none, none);
    EXPECT_NE(std::exchange(dun.ActiveRasConn, platform::kNoRasConnection), platform::kNoRasConnection);
  }

  EXPECT_EQ(dun.HangUpAllConnections(), kTrue16);

  std::uint32_t bytes = 4;
  std::uint32_t count = 77;
  std::array<std::uint8_t, 4> sizeWord{};
  PutLittle32(sizeWord, 0, platform::RasConnectionRecord::kBytes);
  EXPECT_EQ(ras.Dials.RasEnumConnectionsA(sizeWord, bytes, count), 0U);
  EXPECT_EQ(count, 0U);
}

TEST_F(MdlDunOnWindows, The_system_has_the_words_of_its_errors) {
  EXPECT_EQ(dun.ReportRasError(691, u"RasDial", kTrue16), kTrue16);

  ASSERT_EQ(ras.Desktop.Boxes.size(), 1U);
  EXPECT_NE(ras.Desktop.Boxes[0].text.find(u"Access denied because"), Text::npos);
}

} // namespace
} // namespace quendra::provisioning

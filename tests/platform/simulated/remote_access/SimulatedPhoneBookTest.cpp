#include "platform/simulated/SimulatedMachineFixture.h"

namespace quendra::platform::simulated {
namespace {

struct SimulatedPhoneBookTest : SimulatedMachineTest {
  SimulatedRemoteAccess& ras = machine.ras;
  std::uint32_t bytes = 0;
  std::uint32_t count = 77;

  Bytes Get(const std::string& name) {
    bytes = 0;
    EXPECT_EQ(ras.RasGetEntryPropertiesA(nullptr, name.c_str(), {}, bytes), kRasBufferTooSmall);
    Bytes image(bytes);
    PutLittle32(image, 0, ras.EntryBytes);
    EXPECT_EQ(ras.RasGetEntryPropertiesA(nullptr, name.c_str(), image, bytes), kRasSuccess);
    return image;
  }
};

TEST_F(SimulatedPhoneBookTest, The_record_of_an_entry_has_the_size_that_the_test_says) {
  for (const std::uint32_t size : {1672U, 1768U, 1796U, 2088U}) {
    ras.EntryBytes = size;
    bytes = 0;

    EXPECT_EQ(ras.RasGetEntryPropertiesA(nullptr, nullptr, {}, bytes), kRasBufferTooSmall);

    EXPECT_EQ(bytes, size);
    Bytes other(4);
    PutLittle32(other, 0, size + 4);
    EXPECT_EQ(ras.RasSetEntryPropertiesA(nullptr, "Home", other), kRasInvalidSize);
  }
  EXPECT_TRUE(ras.EntryNames().empty());
}

TEST_F(SimulatedPhoneBookTest, Alternate_numbers_come_behind_the_record_and_survive_being_written_back) {
  ras.AddEntry("Home").alternateNumbers = {"111", "2222"};

  const Bytes image = Get("Home");
  EXPECT_EQ(TextOf(image).substr(RasEntry::kBytes), std::string("111\0"
                                                                "2222\0\0",
                                                                10));
  ASSERT_EQ(ras.RasSetEntryPropertiesA(nullptr, "Copy", image), kRasSuccess);

  EXPECT_EQ(ras.Entry("Copy")->alternateNumbers, (Lines{"111", "2222"}));
}

TEST_F(SimulatedPhoneBookTest, A_short_record_has_a_short_device_name) {
  ras.EntryBytes = RasEntry::kBytesOfShortDeviceNames;
  ras.AddEntry("Home").SetDevice("modem", std::string(40, 'x'));

  EXPECT_EQ(ras.Entry("Home")->DeviceType(), "modem");
  EXPECT_EQ(ras.Entry("Home")->DeviceName(), std::string(32, 'x'));
}

TEST_F(SimulatedPhoneBookTest, Sizes_of_dial_parameters_are_those_that_the_test_says) {
  ras.AddEntry("Home").SetLogin("user", "secret");
  ras.DialParamsSizes = {816};
  bool hasPassword = false;
  Bytes params(1060);
  for (const std::uint32_t size : {1060U, 1052U}) {
    PutLittle32(params, 0, size);
    EXPECT_EQ(ras.RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasInvalidSize) << size;
  }
  PutLittle32(params, 0, 816);
  EXPECT_EQ(ras.RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasCannotFindPhonebookEntry);
  PutTextAt(params, 4, 21, "hOME");

  EXPECT_EQ(ras.RasGetEntryDialParamsA(nullptr, params, hasPassword), kRasSuccess);

  EXPECT_TRUE(hasPassword);
  EXPECT_EQ(TextAt(params, 25 + 129 + 129, 257), "user");
}

TEST_F(SimulatedPhoneBookTest, Any_operation_can_be_refused_from_a_call_on_that_the_test_names) {
  ras.Refuse("RasEnumDevicesA", 711, 1);

  EXPECT_EQ(ras.RasEnumDevicesA({}, bytes, count), kRasSuccess);
  EXPECT_EQ(ras.RasEnumDevicesA({}, bytes, count), 711U);
  EXPECT_EQ(ras.RasEnumDevicesA({}, bytes, count), 711U);
  ras.Allow("RasEnumDevicesA");

  EXPECT_EQ(ras.RasEnumDevicesA({}, bytes, count), kRasSuccess);
  EXPECT_EQ(ras.Count("RasEnumDevicesA"), 4);
}

TEST_F(SimulatedPhoneBookTest, Without_remote_access_every_operation_says_so) {
  ras.IsThere = false;
  std::array<char, 512> text{};

  EXPECT_EQ(ras.RasEnumEntriesA(nullptr, {}, bytes, count), kRasManagerCannotStart);
  EXPECT_EQ(count, 0U);
  EXPECT_EQ(ras.RasDeleteEntryA(nullptr, "Home"), kRasManagerCannotStart);
  EXPECT_EQ(ras.RasGetErrorStringA(691, text), kRasManagerCannotStart);
  EXPECT_EQ(ras.RasHangUpA(RasConnection(1)), kRasManagerCannotStart);
}

TEST_F(SimulatedPhoneBookTest, The_phone_book_that_a_call_named_is_known_afterwards) {
  ras.RasDeleteEntryA("C:\\a.pbk", "Home");
  ras.RasEnumEntriesA(nullptr, {}, bytes, count);

  EXPECT_EQ(ras.PhoneBookOf["RasDeleteEntryA"], "C:\\a.pbk");
  EXPECT_EQ(ras.PhoneBookOf["RasEnumEntriesA"], std::nullopt);
  EXPECT_EQ(machine.Calls, Lines{"RasDeleteEntryA Home"});
}

} // namespace
} // namespace quendra::platform::simulated

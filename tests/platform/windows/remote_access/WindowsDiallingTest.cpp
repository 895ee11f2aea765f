#include "platform/process/SystemErrors.h"
#include "platform/remote_access/RemoteAccessBehaviour.h"
#include "platform/windows/remote_access/StandInRemoteAccess.h"

#include <array>
#include <optional>
#include <string_view>
#include <utility>
#include <vector>

namespace quendra::platform::windows {
namespace {

using Bytes = std::vector<std::uint8_t>;
using Told = std::vector<std::pair<std::uint32_t, std::uint32_t>>;

struct WindowsDiallingTest : testing::Test {
  static Bytes Record(std::uint32_t bytes) {
    Bytes record(bytes);
    PutLittle32(record, 0, bytes);
    return record;
  }
  static Bytes Params(const std::string& name) {
    Bytes params = Record(RasDialParams::kBytes);
    std::ranges::copy(name, params.begin() + RasDialParams::kEntryName);
    return params;
  }
  void Make(const char* name) {
    ASSERT_EQ(ras.Book.RasSetEntryPropertiesA(nullptr, name, Record(RasEntry::kBytes)), kRasSuccess);
  }
  /// A window that keeps what it is told in a list.
  WindowHandle Listener(Told& told) {
    using Procedure = forms::WindowProcedure::element_type;
    const std::uint32_t number = ras.Desktop.RegisterWindowMessageA(kRasDialEventName);
    return ras.Desktop.Windows.Add(
        std::make_shared<Procedure>([&told, number](auto, auto message, auto state, auto error) {
          if (message == number) told.push_back({state, error});
          return 0;
        }));
  }
  RasConnection Dial(const std::string& name, WindowHandle window) {
    RasConnection connection;
    EXPECT_EQ(ras.Dials.RasDialA({}, nullptr, Params(name), {kRasNotifierIsWindow, window}, connection),
              kRasSuccess);
    return connection;
  }

  StandInRemoteAccess ras{"097: 0 5 691; Other: 0 1 8192; Slow: 0 60000ms 8192; Lost: 0 678"};
};

TEST_F(WindowsDiallingTest, States_and_the_error_of_a_dial_come_in_their_order) {
  Make("097");
  Told told;

  const RasConnection connection = Dial("097", Listener(told));

  ASSERT_TRUE(ras.Until([&] { return told.size() >= 3; }));
  EXPECT_EQ(told, (Told{{0, 0}, {5, 0}, {5, 691}}));
  EXPECT_EQ(ras.Dials.RasHangUpA(connection), kRasSuccess);
}

TEST_F(WindowsDiallingTest, Two_dials_at_a_time_tell_each_its_own_window) {
  Make("097");
  Make("Other");
  Told first;
  Told second;

  const RasConnection one = Dial("097", Listener(first));
  const RasConnection two = Dial("Other", Listener(second));

  ASSERT_TRUE(ras.Until([&] { return first.size() >= 3 && second.size() >= 3; }));
  EXPECT_EQ(first, (Told{{0, 0}, {5, 0}, {5, 691}}));
  EXPECT_EQ(second, (Told{{0, 0}, {1, 0}, {8192, 0}}));
  for (const RasConnection connection : {one, two}) EXPECT_EQ(ras.Dials.RasHangUpA(connection), kRasSuccess);
}

TEST_F(WindowsDiallingTest, A_dial_that_was_hung_up_tells_no_more) {
  Make("097");
  Make("Other");
  Told hungUp;
  Told told;
  const RasConnection connection = Dial("097", Listener(hungUp));

  EXPECT_EQ(ras.Dials.RasHangUpA(connection), kRasSuccess);

  const RasConnection next = Dial("Other", Listener(told));
  ASSERT_TRUE(ras.Until([&] { return told.size() >= 3; }));
  EXPECT_EQ(hungUp, Told());
  EXPECT_EQ(ras.Dials.RasHangUpA(next), kRasSuccess);
}

TEST_F(WindowsDiallingTest, A_machine_that_goes_during_a_dial_is_told_no_more) {
  Make("097");
  Told told;
  RasConnection connection;
  {
    WindowsDialling dials(ras.Calls, ras.Desktop);
    const Dialling::Notifier notifier{kRasNotifierIsWindow, Listener(told)};
    ASSERT_EQ(dials.RasDialA({}, nullptr, Params("097"), notifier, connection), kRasSuccess);
  }
  int rounds = 0;
  ras.Until([&] { return ++rounds == 20; });

  EXPECT_EQ(told, Told());
  EXPECT_EQ(ras.Dials.RasHangUpA(connection), kRasSuccess);
}

TEST_F(WindowsDiallingTest, What_was_hung_up_has_ended_before_the_program_goes) {
  Make("Slow");
  Told told;
  RasConnection connection;
  {
    WindowsDialling dials(ras.Calls, ras.Desktop);
    const Dialling::Notifier notifier{kRasNotifierIsWindow, Listener(told)};
    ASSERT_EQ(dials.RasDialA({}, nullptr, Params("Slow"), notifier, connection), kRasSuccess);
    ASSERT_EQ(dials.RasHangUpA(connection), kRasSuccess);
  }

  RASCONNSTATUSW status{};
  status.dwSize = sizeof status;
  EXPECT_EQ(ras.Calls.Calls().GetConnectStatus(reinterpret_cast<HRASCONN>(connection.Value()), &status),
            DWORD{kErrorInvalidHandle});
}

TEST_F(WindowsDiallingTest, A_dial_has_a_window_of_the_system_until_it_is_hung_up) {
  Make("Slow");
  Told told;
  const auto relay = [] { return ::FindWindowExW(HWND_MESSAGE, nullptr, L"QuendraDialRelay", nullptr); };
  const RasConnection connection = Dial("Slow", Listener(told));
  EXPECT_NE(relay(), nullptr);

  EXPECT_EQ(ras.Dials.RasHangUpA(connection), kRasSuccess);

  EXPECT_EQ(relay(), nullptr);
}

TEST_F(WindowsDiallingTest, A_failed_dial_that_tells_nobody_leaves_no_line_open) {
  Make("Lost");
  RasConnection connection;

  EXPECT_EQ(ras.Dials.RasDialA({}, nullptr, Params("Lost"), {}, connection), kRasNoAnswer);

  EXPECT_EQ(connection, kNoRasConnection);
  Bytes size = Record(RasConnectionRecord::kBytes);
  std::uint32_t bytes = RasConnectionRecord::kBytes;
  std::uint32_t count = 77;
  EXPECT_EQ(ras.Dials.RasEnumConnectionsA(size, bytes, count), kRasSuccess);
  EXPECT_EQ(count, 0U);
}

TEST_F(WindowsDiallingTest, The_number_of_a_procedure_is_no_notifier) {
  Make("Other");
  RasConnection connection;
  for (const std::uint32_t type : {0U, 1U, 2U}) {
    const Dialling::Notifier notifier{type, WindowHandle(0x1000)};
    EXPECT_EQ(ras.Dials.RasDialA({}, nullptr, Params("Other"), notifier, connection), kRasSuccess) << type;
    EXPECT_EQ(ras.Dials.RasHangUpA(connection), kRasSuccess);
  }
}

TEST_F(WindowsDiallingTest, A_size_word_alone_asks_how_many_connections_stand) {
  Make("Other");
  RasConnection connection;
  ASSERT_EQ(ras.Dials.RasDialA({}, nullptr, Params("Other"), {}, connection), kRasSuccess);
  Bytes sizeWord(4);
  PutLittle32(sizeWord, 0, RasConnectionRecord::kBytes);
  std::uint32_t bytes = 4;
  std::uint32_t count = 0;

  EXPECT_EQ(ras.Dials.RasEnumConnectionsA(sizeWord, bytes, count), kRasBufferTooSmall);

  EXPECT_EQ(count, 1U);
  EXPECT_EQ(bytes, RasConnectionRecord::kBytes);
  EXPECT_EQ(ras.Dials.RasHangUpA(connection), kRasSuccess);
}

TEST_F(WindowsDiallingTest, A_connection_carries_its_device_and_the_systems_own_handle) {
  Bytes entry = Record(RasEntry::kBytes);
  std::ranges::copy(std::string("pppoe"), entry.begin() + RasEntry::kDeviceType);
  std::ranges::copy(std::string("WAN"), entry.begin() + RasEntry::kDeviceName);
  ASSERT_EQ(ras.Book.RasSetEntryPropertiesA(nullptr, "Other", entry), kRasSuccess);
  RasConnection connection;
  ASSERT_EQ(ras.Dials.RasDialA({}, nullptr, Params("Other"), {}, connection), kRasSuccess);
  Bytes record = Record(RasConnectionRecord::kBytes);
  std::uint32_t bytes = RasConnectionRecord::kBytes;
  std::uint32_t count = 0;

  ASSERT_EQ(ras.Dials.RasEnumConnectionsA(record, bytes, count), kRasSuccess);

  using Fields = RasConnectionRecord;
  EXPECT_EQ(Little32(record, Fields::kHandle), connection.Value());
  EXPECT_STREQ(reinterpret_cast<const char*>(&record[Fields::kDeviceType]), "pppoe");
  EXPECT_STREQ(reinterpret_cast<const char*>(&record[Fields::kDeviceName]), "WAN");
  EXPECT_EQ(ras.Dials.RasHangUpA(connection), kRasSuccess);
}

TEST_F(WindowsDiallingTest, A_record_that_says_more_than_it_holds_is_not_read) {
  Make("Other");
  Bytes extensions = Record(RasDialExtensions::kBytes);
  PutLittle32(extensions, 0, 28);
  RasConnection connection;

  EXPECT_EQ(ras.Dials.RasDialA(extensions, nullptr, Params("Other"), {}, connection), kRasInvalidSize);

  EXPECT_EQ(connection, kNoRasConnection);
}

TEST_F(WindowsDiallingTest, An_entry_outlives_the_backend_that_made_it) {
  Make("Home");
  RasCalls calls(&StandInRasLibrary);
  WindowsPhoneBook other(calls);
  std::uint32_t bytes = 0;
  std::uint32_t count = 0;

  EXPECT_EQ(other.RasEnumEntriesA(nullptr, {}, bytes, count), kRasBufferTooSmall);

  EXPECT_EQ(count, 1U);
  EXPECT_EQ(bytes, RasEntryName::kBytes) << "in records of the program's own size";
}

TEST_F(WindowsDiallingTest, Texts_that_fill_their_fields_are_not_read_beyond_the_record) {
  Bytes entry = Record(RasEntry::kBytes);
  std::fill(entry.begin() + RasEntry::kAreaCode, entry.end(), std::uint8_t{'x'});
  PutLittle32(entry, RasEntry::kAlternateOffset, RasEntry::kBytes - 4);
  EXPECT_EQ(ras.Book.RasSetEntryPropertiesA(nullptr, "Full", entry), kRasSuccess);
  Bytes params(RasDialParams::kBytesWithoutNumbers, 'x');
  PutLittle32(params, 0, RasDialParams::kBytesWithoutNumbers);
  RasConnection connection;

  EXPECT_EQ(ras.Dials.RasDialA({}, nullptr, params, {}, connection), kRasCannotFindPhonebookEntry);
}

TEST_F(WindowsDiallingTest, Names_reach_the_system_as_letters_whatever_its_code_page) {
  Make("\xE1\xE9\xFA");
  RASENTRYNAMEW name{};
  name.dwSize = sizeof name;
  DWORD bytes = sizeof name;
  DWORD count = 0;

  ASSERT_EQ(ras.Calls.Calls().EnumEntries(nullptr, nullptr, &name, &bytes, &count), DWORD{kRasSuccess});

  EXPECT_EQ(winapi::TextOf(name.szEntryName), u"\u05D1\u05D9\u05EA");
}

TEST_F(WindowsDiallingTest, What_is_said_of_an_error_fits_the_room_with_its_NUL_or_is_not_said) {
  std::array<char, 512> text{};
  ASSERT_EQ(ras.Dials.RasGetErrorStringA(691, text), kRasSuccess);
  const std::size_t length = std::string_view(text.data()).size();
  std::vector<char> room(length + 1, 'x');

  EXPECT_EQ(ras.Dials.RasGetErrorStringA(691, room), kRasSuccess);
  EXPECT_STREQ(room.data(), text.data());
  EXPECT_NE(ras.Dials.RasGetErrorStringA(691, std::span(room).first(length)), kRasSuccess);
}

TEST_F(WindowsDiallingTest, A_named_phone_book_is_the_systems_to_find) {
  std::uint32_t bytes = 0;
  std::uint32_t count = 0;

  constexpr std::uint32_t kCannotOpen = 621;
  EXPECT_EQ(ras.Book.RasEnumEntriesA("C:\\missing.pbk", {}, bytes, count), kCannotOpen);
  EXPECT_EQ(ras.Book.RasDeleteEntryA("C:\\missing.pbk", "Home"), kCannotOpen);
}

TEST_F(WindowsDiallingTest, A_dial_that_is_hung_up_elsewhere_is_no_handle_any_more) {
  Make("Other");
  Told told;
  const RasConnection connection = Dial("Other", Listener(told));
  ASSERT_EQ(ras.Calls.Calls().HangUp(reinterpret_cast<HRASCONN>(connection.Value())), DWORD{kRasSuccess});

  EXPECT_EQ(ras.Dials.RasHangUpA(connection), kErrorInvalidHandle);
}

// A system without remote access.

struct WithoutRemoteAccess : testing::Test {
  forms::headless::HeadlessDesktop desktop;
  RasCalls calls{[] { return winapi::SystemLibrary(L"no-such-library.dll"); }};
  WindowsPhoneBook book{calls};
  WindowsDialling dials{calls, desktop};
  std::uint32_t bytes = 0;
  std::uint32_t count = 77;
};

TEST_F(WithoutRemoteAccess, The_phone_book_answers_that_it_cannot_start) {
  Bytes record(RasDialParams::kBytes);
  PutLittle32(record, 0, RasDialParams::kBytes);
  bool hasPassword = true;

  EXPECT_EQ(book.RasEnumEntriesA(nullptr, {}, bytes, count), kRasManagerCannotStart);
  EXPECT_EQ(std::exchange(count, 77), 0U);
  EXPECT_EQ(book.RasEnumDevicesA({}, bytes, count), kRasManagerCannotStart);
  EXPECT_EQ(count, 0U);
  EXPECT_EQ(book.RasDeleteEntryA(nullptr, "Home"), kRasManagerCannotStart);
  EXPECT_EQ(book.RasGetEntryPropertiesA(nullptr, "", {}, bytes), kRasManagerCannotStart);
  EXPECT_EQ(book.RasSetEntryPropertiesA(nullptr, "Home", record), kRasManagerCannotStart);
  EXPECT_EQ(book.RasGetEntryDialParamsA(nullptr, record, hasPassword), kRasManagerCannotStart);
  EXPECT_FALSE(hasPassword);
  EXPECT_EQ(book.RasSetEntryDialParamsA(nullptr, record, false), kRasManagerCannotStart);
}

TEST_F(WithoutRemoteAccess, Dials_answer_that_it_cannot_start) {
  RasConnection connection;
  std::array<char, 512> text{};

  EXPECT_EQ(dials.RasDialA({}, nullptr, {}, {}, connection), kRasManagerCannotStart);
  EXPECT_EQ(connection, kNoRasConnection);
  EXPECT_EQ(dials.RasHangUpA(RasConnection(1)), kRasManagerCannotStart);
  EXPECT_EQ(dials.RasEnumConnectionsA({}, bytes, count), kRasManagerCannotStart);
  EXPECT_EQ(count, 0U);
  EXPECT_EQ(dials.RasGetErrorStringA(691, text), kCallNotImplemented);
}

} // namespace
} // namespace quendra::platform::windows

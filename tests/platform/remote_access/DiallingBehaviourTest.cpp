#include "platform/process/SystemErrors.h"
#include "platform/remote_access/RemoteAccessBehaviour.h"

#include <array>

namespace quendra::platform {
namespace {

TEST_P(RemoteAccessBehaviourTest, A_dial_with_a_window_returns_at_once_and_tells_of_its_end) {
  Set("Home", BroadbandEntry());

  EXPECT_EQ(Dial("Home", {kRasNotifierIsWindow, Listener()}), kRasSuccess);
  EXPECT_NE(connection, kNoRasConnection);
  EXPECT_TRUE(events.empty()) << "which come from the loop";
  ASSERT_TRUE(UntilTheEndOfTheDial());

  EXPECT_EQ(events.back().error == 0, backend->Connects());
  for (std::size_t i = 0; i + 1 < events.size(); ++i) EXPECT_EQ(events[i].error, 0U) << i;
  EXPECT_EQ(Dials().RasHangUpA(connection), kRasSuccess);
}

TEST_P(RemoteAccessBehaviourTest, No_state_of_a_dial_is_told_twice_in_a_row) {
  Set("Home", BroadbandEntry());
  Dial("Home", {kRasNotifierIsWindow, Listener()});
  ASSERT_TRUE(UntilTheEndOfTheDial());

  for (std::size_t i = 1; i < events.size(); ++i)
    EXPECT_TRUE(events[i].state != events[i - 1].state || events[i].error != events[i - 1].error) << i;
  Dials().RasHangUpA(connection);
}

TEST_P(RemoteAccessBehaviourTest, A_dial_without_a_window_returns_with_its_outcome) {
  Set("Home", BroadbandEntry());
  for (const Dialling::Notifier& nobody :
       {Dialling::Notifier{}, Dialling::Notifier{kRasNotifierIsWindow, kNoWindow}}) {
    const std::uint32_t result = Dial("Home", nobody);

    EXPECT_EQ(result == kRasSuccess, backend->Connects());
    EXPECT_EQ(connection != kNoRasConnection, backend->Connects());
    if (connection != kNoRasConnection) {
      EXPECT_EQ(Dials().RasHangUpA(connection), kRasSuccess);
    }
    connection = kNoRasConnection;
  }
}

TEST_P(RemoteAccessBehaviourTest, A_missing_entry_cannot_be_dialled) {
  for (const char* name : {"", "Home"}) {
    EXPECT_EQ(Dial(name, {kRasNotifierIsWindow, Listener()}), kRasCannotFindPhonebookEntry) << name;
    EXPECT_EQ(connection, kNoRasConnection);
  }
}

TEST_P(RemoteAccessBehaviourTest, A_dial_by_records_of_another_size_or_that_were_cut_is_refused) {
  Set("Home", BroadbandEntry());
  Bytes params = Params("Home");
  EXPECT_NE(Dials().RasDialA(Record(12), nullptr, params, {}, connection), kRasSuccess);
  EXPECT_NE(Dials().RasDialA({}, nullptr, std::span(params).first(100), {}, connection), kRasSuccess);
  PutLittle32(params, 0, 1056);

  EXPECT_EQ(Dials().RasDialA({}, nullptr, params, {}, connection), kRasInvalidSize);

  EXPECT_EQ(connection, kNoRasConnection);
}

TEST_P(RemoteAccessBehaviourTest, A_connection_is_listed_in_every_accepted_size) {
  Set("Home", BroadbandEntry());
  Dial("Home", {});
  const Lines expected = backend->Connects() ? Lines{"Home"} : Lines();
  int accepted = 0;
  for (const std::uint32_t size : {692U, 676U, 412U, 32U}) {
    Lines names;
    const std::uint32_t result = Connections(size, names);
    if (result == kRasInvalidSize) continue;
    ++accepted;
    EXPECT_EQ(result, kRasSuccess) << size;
    EXPECT_EQ(names, expected) << size;
  }
  EXPECT_GE(accepted, 1);
}

TEST_P(RemoteAccessBehaviourTest, A_connection_that_was_hung_up_is_listed_no_more) {
  Set("Home", BroadbandEntry());
  Dial("Home", {kRasNotifierIsWindow, Listener()});
  ASSERT_TRUE(UntilTheEndOfTheDial());

  EXPECT_EQ(Dials().RasHangUpA(connection), kRasSuccess);

  const auto noneIsListed = [this] {
    Lines names;
    return Connections(692, names) == kRasSuccess && names.empty();
  };
  EXPECT_TRUE(backend->Until(noneIsListed));
}

TEST_P(RemoteAccessBehaviourTest, Connections_in_records_of_another_size_are_refused) {
  for (const std::uint32_t size : {4U, 100U, 693U}) {
    Lines names;
    EXPECT_EQ(Connections(size, names), kRasInvalidSize) << size;
  }
}

TEST_P(RemoteAccessBehaviourTest,
       A_connection_that_was_hung_up_may_be_hung_up_again_and_no_other_handle_may) {
  Set("Home", BroadbandEntry());
  Dial("Home", {kRasNotifierIsWindow, Listener()});
  ASSERT_TRUE(UntilTheEndOfTheDial());
  EXPECT_EQ(Dials().RasHangUpA(connection), kRasSuccess);

  EXPECT_EQ(Dials().RasHangUpA(connection), kRasSuccess);
  EXPECT_NE(Dials().RasHangUpA(kNoRasConnection), kRasSuccess);
  EXPECT_NE(Dials().RasHangUpA(RasConnection(0xFFFFFFFF)), kRasSuccess);
}

TEST_P(RemoteAccessBehaviourTest, A_dial_that_is_hung_up_under_way_may_be_dialled_again) {
  Set("Home", BroadbandEntry());
  const WindowHandle window = Listener();
  Dial("Home", {kRasNotifierIsWindow, window});
  const RasConnection first = connection;
  EXPECT_EQ(Dials().RasHangUpA(first), kRasSuccess);
  events.clear();
  connection = kNoRasConnection;

  EXPECT_EQ(Dial("Home", {kRasNotifierIsWindow, window}), kRasSuccess);

  EXPECT_NE(connection, first);
  EXPECT_TRUE(UntilTheEndOfTheDial());
  EXPECT_EQ(Dials().RasHangUpA(connection), kRasSuccess);
}

TEST_P(RemoteAccessBehaviourTest, A_window_that_goes_during_a_dial_does_no_harm) {
  Set("Home", BroadbandEntry());
  const WindowHandle window = Listener();
  Dial("Home", {kRasNotifierIsWindow, window});

  backend->Desktop().Windows.Destroy(window);
  int rounds = 0;
  backend->Until([&] { return ++rounds == 20; });

  EXPECT_TRUE(events.empty());
  EXPECT_EQ(Dials().RasHangUpA(connection), kRasSuccess);
}

// Texts of errors.

TEST_P(RemoteAccessBehaviourTest, The_errors_of_dials_have_a_text_each_that_ends_in_a_NUL) {
  for (const std::uint32_t error : {623U, 633U, 678U, 691U, 711U}) {
    std::array<char, 512> text;
    text.fill('x');
    EXPECT_EQ(Dials().RasGetErrorStringA(error, text), kRasSuccess) << error;
    const auto end = std::ranges::find(text, '\0');
    EXPECT_NE(end, text.end()) << error;
    EXPECT_NE(end, text.begin()) << error;
  }
}

TEST_P(RemoteAccessBehaviourTest, A_number_that_is_not_one_of_its_own_has_no_text) {
  std::array<char, 512> text{};
  for (const std::uint32_t error : {0U, 5U, 99999U, 0xFFFFFFFFU})
    EXPECT_EQ(Dials().RasGetErrorStringA(error, text), kInvalidParameter) << error;
}

TEST_P(RemoteAccessBehaviourTest, A_text_that_does_not_fit_its_buffer_is_refused) {
  std::array<char, 3> text{'a', 'b', 'c'};

  EXPECT_NE(Dials().RasGetErrorStringA(691, text), kRasSuccess);
  EXPECT_NE(Dials().RasGetErrorStringA(691, {}), kRasSuccess);
}

} // namespace
} // namespace quendra::platform

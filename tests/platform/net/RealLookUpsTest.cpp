#include "platform/net/RealSocketsFixture.h"
#include "runtime/ByteFields.h"

#include <array>

namespace quendra::platform {

TEST_F(RealSocketsTest, A_name_is_found_and_its_addresses_stand_in_the_buffer) {
  std::array<std::uint8_t, 1024> buffer{};
  const LookUpHandle lookUp = sockets.WSAAsyncGetHostByName(Window(), kNameMessage, "localhost", buffer);
  ASSERT_NE(lookUp, kNoLookUp);
  ASSERT_TRUE(Until([&] { return !names.empty(); }));
  EXPECT_EQ(names, (std::vector<Seen>{{SocketHandle(lookUp.Value()), 0, 0}}));
  EXPECT_GE(Little32(buffer, 0), 1u);
  EXPECT_EQ(Big32(buffer, 4), kLoopbackNumber);
}

TEST_F(RealSocketsTest, A_name_that_no_host_can_have_is_not_found) {
  std::array<std::uint8_t, 1024> buffer{};
  for (const std::string& name : {std::string(300, 'x'), std::string(70'000, 'y')}) {
    names.clear();
    const LookUpHandle lookUp = sockets.WSAAsyncGetHostByName(Window(), kNameMessage, name, buffer);
    ASSERT_TRUE(Until([&] { return !names.empty(); }));
    EXPECT_EQ(names, (std::vector<Seen>{{SocketHandle(lookUp.Value()), 0, 11001}}));
  }
}

TEST_F(RealSocketsTest, A_look_up_that_is_cancelled_tells_nothing_and_can_not_be_cancelled_twice) {
  std::array<std::uint8_t, 1024> buffer{};
  const LookUpHandle lookUp = sockets.WSAAsyncGetHostByName(Window(), kNameMessage, "localhost", buffer);
  EXPECT_EQ(sockets.WSACancelAsyncRequest(lookUp), 0);
  EXPECT_EQ(sockets.WSACancelAsyncRequest(lookUp), kSocketError);
  EXPECT_EQ(LastError(), kInvalidArgument);
  Settle();
  EXPECT_TRUE(names.empty());
  EXPECT_EQ(buffer[0], 0);
}

TEST_F(RealSocketsTest, The_sockets_may_go_while_look_ups_run) {
  std::array<std::uint8_t, 64> buffer{};
  for (int round = 0; round < 20; ++round) {
    const auto gone = MakeRealSockets();
    gone->Operations().WSAStartup(257);
    for (int i = 0; i < 5; ++i)
      gone->Operations().WSAAsyncGetHostByName(WindowHandle(1), kNameMessage, "localhost", buffer);
    gone->WaitFor([] { return true; }, 0);
  }
  Settle();
  EXPECT_TRUE(names.empty());
}

} // namespace quendra::platform

#include "foundation/SimulatedWorld.h"

#include <algorithm>

namespace quendra::foundation {
namespace {

using SocketSends = SocketTest;

TEST_F(SocketSends, Data_goes_out_in_pieces_of_the_send_buffers_size) {
  Net().SendBufferSize = 10;
  Connect(1);
  Object->SendData(1, Text(25, u'x'));
  EXPECT_EQ(Net().Count("send"), 3);
  EXPECT_EQ(Peer().Received, std::string(25, 'x'));
  EXPECT_EQ(Object.Events, (Events{"SendProgress 1 25 0", "SendComplete 1"}));
}

TEST_F(SocketSends, A_refused_send_reports_what_went_out_and_FD_WRITE_goes_on_with_a_fresh_total) {
  Net().SendBufferSize = 4;
  Server.TakeAtMost(10);
  Connect(1);
  Object->SendData(1, Text(u"abcdefghijklmno"));
  EXPECT_EQ(Object.Events, Events{"SendProgress 1 10 5"});
  Settle();
  EXPECT_EQ(Peer().Received, "abcdefghijklmno");
  EXPECT_EQ(Object.Events, (Events{"SendProgress 1 10 5", "SendProgress 1 5 0", "SendComplete 1"}));
}

TEST_F(SocketSends, A_single_byte_that_went_out_before_a_refusal_is_reported) {
  Server.TakeAtMost(1);
  Connect(1);
  Object->SendData(1, Text(u"abc"));
  EXPECT_EQ(Object.Events, Events{"SendProgress 1 1 2"});
}

TEST_F(SocketSends, A_send_that_is_refused_at_once_reports_nothing) {
  Connect(1);
  Net().Fail("send", 10035);
  Object->SendData(1, Text(u"abc"));
  EXPECT_TRUE(Object.Events.empty());
  EXPECT_EQ(Object->State(1), sckConnected);
  Settle();
  EXPECT_EQ(Object.Events, (Events{"SendProgress 1 3 0", "SendComplete 1"}));
}

TEST_F(SocketSends, Data_added_behind_refused_data_waits_for_the_next_FD_WRITE) {
  Server.TakeAtMost(2);
  Connect(1);
  Object->SendData(1, Text(u"abc"));
  Object->SendData(1, Text(u"def"));
  EXPECT_EQ(Peer().Received, "ab");
  Settle();
  EXPECT_EQ(Peer().Received, "abcdef");
  EXPECT_EQ(std::count(Object.Events.begin(), Object.Events.end(), "SendComplete 1"), 1);
}

TEST_F(SocketSends, FD_WRITE_with_nothing_to_send_does_nothing) {
  Connect(1);
  Object->WndProc(WindowHandle(), 32769, static_cast<std::uint32_t>(Object->SocketHandle(1)), 2);
  EXPECT_EQ(Net().Count("send"), 0);
  EXPECT_TRUE(Object.Events.empty());
}

TEST_F(SocketSends, A_handler_of_SendProgress_that_sends_more_has_it_sent_before_the_completion) {
  Connect(1);
  int left = 2;
  Object->Events.SendProgress = [&](const Variant& index, std::int32_t, std::int32_t) {
    Object.Events.push_back("progress");
    if (left-- > 0) Object->SendData(index, Text(u"more"));
  };
  Object->SendData(1, Text(u"first"));
  EXPECT_EQ(Peer().Received, "firstmoremore");
  EXPECT_EQ(Object.Events, (Events{"progress", "progress", "progress", "SendComplete 1", "SendComplete 1",
                                   "SendComplete 1"}));
}

TEST_F(SocketSends, A_handler_of_SendProgress_that_closes_the_socket_still_gets_SendComplete) {
  Connect(1);
  Object->Events.SendProgress = [&](const Variant& index, std::int32_t, std::int32_t) {
    Object->CloseSck(index);
  };
  Object->SendData(1, Text(u"data"));
  EXPECT_EQ(Object.Events, Events{"SendComplete 1"});
}

TEST_F(SocketSends, A_handler_of_SendProgress_that_closes_and_connects_again_sends_nothing_old) {
  Server.TakeAtMost(2);
  Connect(1);
  bool again = false;
  Object->Events.SendProgress = [&](const Variant& index, std::int32_t, std::int32_t) {
    if (std::exchange(again, true)) return;
    Object->CloseSck(index);
    Object->Connect(index, Text(u"10.1.1.1"), 80);
  };
  Object->SendData(1, Text(u"old"));
  Settle();
  ASSERT_EQ(Server.Connections.size(), 2u);
  EXPECT_EQ(Server.Connections[0]->Received, "ol");
  EXPECT_EQ(Server.Connections[1]->Received, "");
}

TEST_F(SocketSends, A_text_goes_out_as_one_byte_a_character_in_the_code_page) {
  Connect(1);
  Object->SendData(1, Text(u"א\u4E2D\U0001F600z"));
  EXPECT_EQ(Peer().Received, "\xE0???z");
}

TEST_F(SocketSends, A_datagram_goes_out_whole_whatever_the_size_of_the_send_buffer) {
  Net().SendBufferSize = 4;
  Add(1, sckUDPProtocol);
  Object->SetRemoteHost(1, u"10.1.1.1");
  Object->SetRemotePort(1, 53);
  Object->SendData(1, Text(1000, u'd'));
  ASSERT_EQ(Net().Datagrams().size(), 1u);
  EXPECT_EQ(Net().Datagrams()[0].bytes.size(), 1000u);
  EXPECT_EQ(Net().Datagrams()[0].to.port, 53);
  EXPECT_TRUE(Object.Events.empty());
}

TEST_F(SocketSends, A_datagram_goes_to_a_name_by_the_blocking_resolver) {
  World.Machine.hostNames.Add("dns", {"10.1.1.53"});
  Add(1, sckUDPProtocol);
  Object->SetRemoteHost(1, u"dns");
  Object->SendData(1, Text(u"q"));
  EXPECT_EQ(Net().Count("WSAAsyncGetHostByName"), 0);
  EXPECT_EQ(Net().Datagrams().at(0).to.address, platform::simulated::AddressOf("10.1.1.53"));
}

TEST_F(SocketSends, An_echoed_datagram_comes_back) {
  Net().EchoDatagrams("10.1.1.1", 7);
  Add(1, sckUDPProtocol);
  Object->SetRemoteHost(1, u"10.1.1.1");
  Object->SetRemotePort(1, 7);
  std::string taken;
  Object->Events.DataArrival = [&](const Variant& index, std::int32_t) { taken = Object.Take(index); };
  Object->SendData(1, Text(u"echo"));
  Settle();
  EXPECT_EQ(taken, "echo");
}

// Receiving.

TEST_F(SocketSends, One_read_of_the_receive_buffers_size_an_event_with_a_growing_total) {
  Net().ReceiveBufferSize = 4;
  Connect(1);
  Peer().Send("abcdefghij");
  Settle();
  EXPECT_EQ(Object.Events, (Events{"DataArrival 1 4", "DataArrival 1 8", "DataArrival 1 10"}));
  EXPECT_EQ(Object.Take(1), "abcdefghij");
}

TEST_F(SocketSends, A_scripted_server_greets_answers_in_pieces_and_closes) {
  Server.Greet("220 hello").Answer({"one", "two"}).Close();
  Add(1);
  Object->Connect(1, Text(u"10.1.1.1"), 80);
  Settle();
  Object->SendData(1, Text(u"GET"));
  Settle();
  EXPECT_EQ(Object.Events, (Events{"Connect 1", "DataArrival 1 9", "SendProgress 1 3 0", "SendComplete 1",
                                   "DataArrival 1 12", "DataArrival 1 15", "CloseSck 1"}));
}

TEST_F(SocketSends, A_slow_server_sends_a_piece_a_step_and_resets_at_the_point_told) {
  Server.Answer({"one", "two"}).Reset().Slowly();
  Connect(1);
  Object->SendData(1, Text(u"GET"));
  Settle();
  Object.Events.clear();
  Events seen;
  while (Net().Step()) {
    Settle();
    seen.push_back(Object.Events.back());
  }
  EXPECT_EQ(seen, (Events{"DataArrival 1 3", "DataArrival 1 6", "Error 1 10054 CSocketPlus.PostSocket"}));
}

TEST_F(SocketSends, A_first_event_message_for_data_that_was_taken_meanwhile_raises_nothing) {
  Connect(1);
  Peer().Send("abc");
  Settle();
  Object.Events.clear();
  EXPECT_EQ(FaultText([&] {
              Object->WndProc(WindowHandle(), 32769, static_cast<std::uint32_t>(Object->SocketHandle(1)), 1);
            }),
            "10035 Resource temporarily unavailable. [CSocketPlus.RecvDataToBuffer]");
  EXPECT_TRUE(Object.Events.empty());
}

TEST_F(SocketSends, Events_that_do_not_fit_the_state_are_passed_over) {
  Connect(1);
  const auto socket = static_cast<std::uint32_t>(Object->SocketHandle(1));
  for (const std::uint32_t event : {8u, 16u, 4u, 64u}) Object->WndProc(WindowHandle(), 32769, socket, event);
  EXPECT_TRUE(Object.Events.empty());
  EXPECT_EQ(Object->State(1), sckConnected);
  Peer().Close();
  Settle();
  Object.Events.clear();
  for (const std::uint32_t event : {1u, 2u, 32u}) Object->WndProc(WindowHandle(), 32769, socket, event);
  EXPECT_TRUE(Object.Events.empty());
  EXPECT_EQ(Object->State(1), sckClosing);
}

// Accepting.

TEST_F(SocketSends, A_connection_that_was_reset_before_it_is_taken_is_connected_and_says_no_more) {
  Add(1);
  Add(2);
  Object->Bind(1, 2000);
  Object->Listen(1);
  Object->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    Net().Count("accept");
    Settle();
    Object->Accept(2, request);
  };
  const auto peer = Net().Dial(2000);
  peer->Reset();
  Settle();
  EXPECT_EQ(Object->State(2), sckConnected);
  EXPECT_TRUE(Object.Events.empty());
}

TEST_F(SocketSends, Accept_of_a_handle_that_is_no_socket_fails_at_its_options) {
  Add(1);
  EXPECT_EQ(FaultText([&] { Object->Accept(1, platform::SocketHandle(9999)); }),
            "10038 Socket operation on nonsocket. [CSocketPlus.ProcessOptions]");
}

TEST_F(SocketSends, Each_connection_beyond_the_backlog_of_5_is_turned_away) {
  Add(1);
  Object->Bind(1, 2000);
  Object->Listen(1);
  for (int i = 0; i < 5; ++i) EXPECT_NE(Net().Dial(2000), nullptr);
  EXPECT_EQ(Net().Dial(2000), nullptr);
}

} // namespace
} // namespace quendra::foundation

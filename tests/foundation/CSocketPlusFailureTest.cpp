#include "foundation/SimulatedWorld.h"

namespace quendra::foundation {
namespace {

using SocketFailures = SocketTest;

TEST_F(SocketFailures, A_socket_that_can_not_be_made_raises_Error_and_stops) {
  Add(1);
  Net().Fail("socket", 10024);
  Object->Connect(1, Text(u"10.1.1.1"), 80);
  EXPECT_EQ(Object.Events, Events{"Error 1 10024 CSocketPlus.SocketExists"});
  EXPECT_EQ(Object->State(1), sckError);
  EXPECT_EQ(Net().Count("bind"), 0);
}

TEST_F(SocketFailures, Buffer_sizes_that_can_not_be_read_are_raised) {
  Add(1);
  Net().Fail("getsockopt", 10055);
  EXPECT_EQ(FaultText([&] { Object->Connect(1, Text(u"10.1.1.1"), 80); }),
            "10055 No buffer space available. [CSocketPlus.ProcessOptions]");
  EXPECT_EQ(Object->State(1), sckClosed);
  EXPECT_NE(Object->SocketHandle(1), -1);
  Object->CloseSck(1);
  EXPECT_EQ(Object->SocketHandle(1), -1);
  EXPECT_EQ(Net().OpenSockets(), 0);
}

TEST_F(SocketFailures, A_selection_that_fails_is_raised_and_the_window_goes_with_the_socket) {
  Add(1);
  Net().Fail("WSAAsyncSelect", 10050);
  EXPECT_EQ(FaultText([&] { Object->Connect(1, Text(u"10.1.1.1"), 80); }),
            "10050 Network is down. [modSocketPlus.RegisterSocket]");
  EXPECT_EQ(World.Desktop.Windows.Count(), 1);
  Object->CloseSck(1);
  EXPECT_EQ(World.Desktop.Windows.Count(), 0);
}

TEST_F(SocketFailures, A_bind_that_fails_is_raised_and_leaves_the_state_closed) {
  Add(1);
  Net().Fail("bind", 10048);
  EXPECT_EQ(FaultText([&] { Object->Bind(1, 25); }),
            "10048 Address already in use. [CSocketPlus.BindInternal]");
  EXPECT_EQ(Object->State(1), sckClosed);
  EXPECT_EQ(Object->LocalPort(1), 0);
}

TEST_F(SocketFailures, A_listen_that_fails_is_raised) {
  Add(1);
  Net().Fail("listen", 10055);
  EXPECT_EQ(FaultText([&] { Object->Listen(1); }), "10055 No buffer space available. [CSocketPlus.Listen]");
  EXPECT_EQ(Object->State(1), sckClosed);
}

TEST_F(SocketFailures, A_connect_that_fails_at_once_raises_Error) {
  Add(1);
  Net().Fail("connect", 10051);
  Object->Connect(1, Text(u"10.1.1.1"), 80);
  EXPECT_EQ(Object.Events, Events{"Error 1 10051 CSocketPlus.ConnectToIP"});
  EXPECT_EQ(Object->State(1), sckError);
}

TEST_F(SocketFailures, A_connect_to_an_impossible_address_is_raised_to_the_caller) {
  Add(1);
  Net().Fail("connect", 10049);
  EXPECT_EQ(FaultText([&] { Object->Connect(1, Text(u"10.1.1.1"), 80); }),
            "10049 Cannot assign requested address. [CSocketPlus.ConnectToIP]");
  EXPECT_EQ(Object->State(1), sckConnecting);
  EXPECT_TRUE(Object.Events.empty());
}

TEST_F(SocketFailures, A_host_that_is_silent_is_waited_for_without_end) {
  Add(1);
  Server.StaySilent();
  Object->Connect(1, Text(u"10.1.1.1"), 80);
  World.Desktop.Advance(3'600'000);
  EXPECT_EQ(Object->State(1), sckConnecting);
  EXPECT_TRUE(Object.Events.empty());
}

TEST_F(SocketFailures, A_connection_that_the_system_gives_up_raises_Error_10060) {
  Add(1);
  Object->Connect(1, Text(u"10.1.1.99"), 80);
  Settle();
  EXPECT_EQ(Object.Events, Events{"Error 1 10060 CSocketPlus.PostSocket"});
}

TEST_F(SocketFailures, The_address_whose_number_is_1_is_taken_for_a_running_look_up) {
  Add(1);
  Object->Connect(1, Text(u"1.0.0.0"), 80);
  Settle();
  EXPECT_EQ(Object->State(1), sckClosed);
  EXPECT_EQ(Net().Count("connect"), 0);
}

TEST_F(SocketFailures, A_name_that_fails_raises_Error_with_its_number) {
  for (const std::int32_t error : {11001, 11002, 11003, 11004}) {
    Add(error);
    World.Machine.sockets.FailName("bad", error);
    Object->Connect(error, Text(u"bad"), 80);
    Settle();
    const std::string number = std::to_string(error);
    EXPECT_EQ(Object.Events.back(), "Error " + number + " " + number + " CSocketPlus.ConnectToIP");
    EXPECT_EQ(Object->State(error), sckError);
  }
}

TEST_F(SocketFailures, A_name_that_stands_for_no_address_is_not_found) {
  World.Machine.hostNames.Add("empty", {});
  Add(1);
  Object->Connect(1, Text(u"empty"), 80);
  Settle();
  EXPECT_EQ(Object.Events, Events{"Error 1 11001 CSocketPlus.ConnectToIP"});
}

TEST_F(SocketFailures, The_first_of_a_names_addresses_is_taken) {
  World.Machine.hostNames.Add("two", {"10.1.1.1", "10.1.1.2"});
  Add(1);
  Object->Connect(1, Text(u"two"), 80);
  Settle();
  EXPECT_EQ(Object->RemoteHostIP(1), u"10.1.1.1");
}

TEST_F(SocketFailures, A_look_up_that_can_not_start_raises_Error) {
  Add(1);
  Net().Fail("WSAAsyncGetHostByName", 10055);
  Object->Connect(1, Text(u"name"), 80);
  EXPECT_EQ(Object.Events, Events{"Error 1 10055 CSocketPlus.ResolveIfHostname"});
  EXPECT_EQ(Object->State(1), sckError);
}

TEST_F(SocketFailures, A_connection_from_the_end_of_a_look_up_that_fails_at_once_raises_Error) {
  World.Machine.hostNames.Add("name", {"10.1.1.1"});
  Add(1);
  Object->Connect(1, Text(u"name"), 80);
  Net().Fail("connect", 10065);
  Settle();
  EXPECT_EQ(Object.Events, Events{"Error 1 10065 CSocketPlus.ConnectToIP"});
}

TEST_F(SocketFailures, Sixty_four_look_ups_one_after_another_keep_one_entry) {
  World.Machine.hostNames.Add("name", {"10.1.1.1"});
  for (int i = 0; i < 64; ++i) {
    Add(1);
    Object->Connect(1, Text(u"name"), 80);
    EXPECT_EQ(Object.module.ResolveCount(), 1);
    Settle();
    ASSERT_EQ(Object->State(1), sckConnected);
    Object->ArrayRemove(1);
  }
  EXPECT_EQ(Object.module.ResolveCount(), 1);
  EXPECT_EQ(Object.module.SocketCount(), 1);
}

TEST_F(SocketFailures, A_look_up_that_ended_just_before_it_is_cancelled_tells_nobody) {
  World.Machine.hostNames.Add("name", {"10.1.1.1"});
  Add(1);
  Object->Connect(1, Text(u"name"), 80);
  World.Desktop.PumpOnce();
  ASSERT_EQ(Net().LookUpsUnderWay(), 0); // the answer is on its way as a message now
  ASSERT_EQ(Object->State(1), sckResolvingHost);
  Object->CloseSck(1);
  Settle();
  EXPECT_EQ(Object->State(1), sckClosed);
  EXPECT_EQ(Net().Count("connect"), 0);
}

TEST_F(SocketFailures, The_answer_to_a_cancelled_look_up_is_not_taken_for_the_next_one) {
  World.Machine.hostNames.Add("first", {"10.1.1.1"});
  Net().NeverAnswer("second");
  Add(1);
  Object->Connect(1, Text(u"first"), 80);
  World.Desktop.PumpOnce();
  Object->CloseSck(1);
  Object->Connect(1, Text(u"second"), 80);
  Settle();
  EXPECT_EQ(Object->State(1), sckResolvingHost);
  EXPECT_EQ(Net().Count("connect"), 0);
}

TEST_F(SocketFailures, An_incoming_connection_whose_buffer_sizes_can_not_be_read_is_raised_and_closed) {
  Add(1);
  Object->Bind(1, 2000);
  Object->Listen(1);
  Net().Fail("getsockopt", 10055);
  const auto peer = Net().Dial(2000);
  Settle();
  EXPECT_TRUE(World.Desktop.Ended);
  EXPECT_TRUE(peer->Ended);
  EXPECT_EQ(Object.module.SocketClassCount(), 1);
}

TEST_F(SocketFailures, An_accept_that_fails_raises_Error_at_the_listener) {
  Add(1);
  Object->Bind(1, 2000);
  Object->Listen(1);
  Net().Fail("accept", 10024);
  Net().Dial(2000);
  Settle();
  EXPECT_EQ(Object.Events, Events{"Error 1 10024 CSocketPlus.PostSocket"});
  EXPECT_EQ(Object->State(1), sckError);
}

TEST_F(SocketFailures, A_read_that_fails_ends_the_program_with_its_text) {
  Connect(1);
  Net().Fail("recv", 10054);
  Peer().Send("x");
  Settle();
  EXPECT_EQ(Object->State(1), sckError);
  ASSERT_EQ(World.Desktop.Boxes.size(), 1u);
  EXPECT_NE(World.Desktop.Boxes[0].text.find(u"Connection reset by peer."), Text::npos);
  EXPECT_TRUE(World.Desktop.Ended);
  EXPECT_EQ(World.Desktop.EndStatus, 1);
}

TEST_F(SocketFailures, A_read_that_fails_is_raised_from_RecvDataToBuffer) {
  Connect(1);
  Net().Fail("recv", 10054);
  const auto socket = static_cast<std::uint32_t>(Object->SocketHandle(1));
  EXPECT_EQ(FaultText([&] { Object->WndProc(WindowHandle(), 32769, socket, 1); }),
            "10054 Connection reset by peer. [CSocketPlus.RecvDataToBuffer]");
  EXPECT_EQ(Object->BytesReceived(1), 0);
}

TEST_F(SocketFailures, A_datagram_that_can_not_be_read_is_raised_from_RecvData) {
  Add(1, sckUDPProtocol);
  Object->Bind(1);
  Net().SendDatagram("10.1.1.1", 53, static_cast<std::uint16_t>(Object->LocalPort(1)), "answer");
  Net().Fail("recvfrom", 10052);
  Variant data;
  EXPECT_EQ(FaultText([&] { Object->GetData(1, data); }),
            "10052 Network dropped connection on reset. [CSocketPlus.RecvData]");
}

TEST_F(SocketFailures, A_send_that_fails_raises_Error_and_keeps_the_data) {
  Connect(1);
  Net().Fail("send", 10053);
  Object->SendData(1, Text(u"data"));
  EXPECT_EQ(Object.Events, Events{"Error 1 10053 CSocketPlus.SendBufferedData"});
  EXPECT_EQ(Object->State(1), sckError);
}

TEST_F(SocketFailures, A_datagram_that_can_not_be_sent_raises_Error) {
  Add(1, sckUDPProtocol);
  Object->SetRemoteHost(1, u"10.1.1.1");
  Net().Fail("sendto", 10065);
  Object->SendData(1, Text(u"data"));
  EXPECT_EQ(Object.Events, Events{"Error 1 10065 CSocketPlus.SendBufferedDataUDP"});
  EXPECT_EQ(Object->State(1), sckError);
}

TEST_F(SocketFailures, A_datagram_whose_socket_can_not_be_made_is_not_sent) {
  Add(1, sckUDPProtocol);
  Net().Fail("socket", 10024);
  Object->SendData(1, Text(u"data"));
  EXPECT_EQ(Object.Events, Events{"Error 1 10024 CSocketPlus.SocketExists"});
  EXPECT_TRUE(Net().Datagrams().empty());
}

TEST_F(SocketFailures, A_close_that_fails_is_raised_and_leaves_the_error_state_and_the_socket) {
  Connect(1);
  const std::int32_t socket = Object->SocketHandle(1);
  Net().Fail("closesocket", 10050);
  EXPECT_EQ(FaultText([&] { Object->CloseSck(1); }), "10050 Network is down. [CSocketPlus.DestroySocket]");
  EXPECT_EQ(Object->State(1), sckError);
  EXPECT_EQ(Object->SocketHandle(1), socket);
  Object->CloseSck(1);
  EXPECT_EQ(Object->State(1), sckClosed);
}

TEST_F(SocketFailures, ArrayRemove_whose_close_fails_keeps_the_index) {
  Connect(1);
  Net().Fail("closesocket", 10050);
  EXPECT_EQ(FaultText([&] { Object->ArrayRemove(1); }), "10050 Network is down. [CSocketPlus.DestroySocket]");
  EXPECT_TRUE(Object->ArrayIndexInUse(1));
}

TEST_F(SocketFailures, A_local_host_name_that_fails_is_raised) {
  World.Machine.hostNames.FailName = true;
  EXPECT_EQ(FaultText([&] { Object->LocalHostName(); }),
            "11001 Host not found. [CSocketPlus.GetLocalHostName]");
}

TEST_F(SocketFailures, A_local_address_that_fails_is_raised) {
  World.Machine.hostNames.FailAddresses = true;
  Add(1);
  EXPECT_EQ(FaultText([&] { Object->LocalIP(1); }), "11001 Host not found. [CSocketPlus.GetLocalIP]");
}

TEST_F(SocketFailures, A_local_name_or_address_that_fails_has_its_own_number_whatever_failed_before) {
  Connect(1);
  Net().Fail("send", 10053);
  Object->SendData(1, Text(u"data"));
  World.Machine.hostNames.FailAddresses = true;
  EXPECT_EQ(FaultText([&] { Object->LocalIP(1); }), "11001 Host not found. [CSocketPlus.GetLocalIP]");
  World.Machine.hostNames.FailName = true;
  EXPECT_EQ(FaultText([&] { Object->LocalHostName(); }),
            "11001 Host not found. [CSocketPlus.GetLocalHostName]");
}

TEST_F(SocketFailures, LocalIP_is_the_connections_own_while_it_is_connected_and_the_hosts_first_otherwise) {
  World.Machine.hostNames.Addresses = {"10.0.0.1", "10.0.0.2"};
  Connect(1);
  EXPECT_EQ(Object->LocalIP(1), u"10.0.0.2");
  Object->CloseSck(1);
  EXPECT_EQ(Object->LocalIP(1), u"10.0.0.1");
}

TEST_F(SocketFailures, The_local_host_name_is_cut_at_256_characters_and_at_its_first_nul) {
  World.Machine.hostNames.Name = std::string(300, 'h');
  EXPECT_EQ(Object->LocalHostName(), Text(256, u'h'));
  World.Machine.hostNames.Name = std::string("host\0rest", 9);
  EXPECT_EQ(Object->LocalHostName(), u"host");
}

// The Error event.

TEST_F(SocketFailures, Error_numbers_are_cut_to_16_bits_and_unknown_ones_have_their_own_text) {
  Connect(1);
  std::int16_t number = 0;
  Text description;
  Object->Events.Error = [&](const Variant&, std::int16_t n, const Text& d, auto&&...) {
    number = n;
    description = d;
  };
  const auto socket = static_cast<std::uint32_t>(Object->SocketHandle(1));
  Object->WndProc(WindowHandle(), 32769, socket, 50000u << 16 | 1u);
  EXPECT_EQ(number, -15536);
  EXPECT_EQ(description, u"Unknown error.");
}

TEST_F(SocketFailures, Error_comes_with_empty_help_a_code_of_0_and_CancelDisplay_set) {
  Add(1);
  bool asked = false;
  Object->Events.Error = [&](const Variant& index, std::int16_t number, const Text& description,
                             std::int32_t code, const Text& source, const Text& helpFile,
                             std::int32_t helpContext, bool& cancelDisplay) {
    asked = true;
    EXPECT_EQ(index, Variant(1));
    EXPECT_EQ(number, 10061);
    EXPECT_EQ(description, u"Connection refused.");
    EXPECT_EQ(code, 0);
    EXPECT_EQ(source, u"CSocketPlus.PostSocket");
    EXPECT_EQ(helpFile, u"");
    EXPECT_EQ(helpContext, 0);
    EXPECT_TRUE(cancelDisplay);
  };
  Server.Refuse();
  Object->Connect(1, Text(u"10.1.1.1"), 80);
  Settle();
  EXPECT_TRUE(asked);
  EXPECT_TRUE(World.Desktop.Boxes.empty());
}

TEST_F(SocketFailures, A_handler_that_clears_CancelDisplay_has_the_error_shown_with_its_source_as_title) {
  Add(1);
  Object->Events.Error = [](const Variant&, std::int16_t, const Text&, std::int32_t, const Text&, const Text&,
                            std::int32_t, bool& cancelDisplay) { cancelDisplay = false; };
  Server.Refuse();
  Object->Connect(1, Text(u"10.1.1.1"), 80);
  Settle();
  const forms::headless::HeadlessDesktop::Box box{u"Connection refused.", 0, u"CSocketPlus.PostSocket"};
  EXPECT_EQ(World.Desktop.Boxes, std::vector{box});
}

TEST_F(SocketFailures, An_error_in_any_event_message_fails_the_socket_in_any_state) {
  Connect(1);
  Peer().Close();
  Settle();
  const auto socket = static_cast<std::uint32_t>(Object->SocketHandle(1));
  Object->WndProc(WindowHandle(), 32769, socket, 10053u << 16 | 2u);
  EXPECT_EQ(Object->State(1), sckError);
  EXPECT_EQ(Object.Events.back(), "Error 1 10053 CSocketPlus.PostSocket");
}

} // namespace
} // namespace quendra::foundation

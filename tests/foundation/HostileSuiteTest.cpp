#include "foundation/SocketSuite.h"

namespace quendra::foundation {
namespace {

/// Handlers and peers that do what nobody expects of them, over both networks.
class HostileSuite : public SocketSuite {
 protected:
  using Events = std::vector<std::string>;
  void OpenDatagrams(const Variant& index) {
    program->ArrayAdd(index);
    program->SetProtocol(index, sckUDPProtocol);
    program->Bind(index);
  }
  void ConnectAgain(const Variant& index) {
    program->CloseSck(index);
    program->Connect(index, Text(u"127.0.0.1"), server->Port());
  }
  std::unique_ptr<FarEnd> NextConnection() {
    std::unique_ptr<FarEnd> far;
    EXPECT_TRUE(world->Until([&] { return (far = server->TakeConnection()) != nullptr; }));
    return far;
  }
};

QUENDRA_OVER_BOTH_NETWORKS(HostileSuite);

// Handlers.

TEST_P(HostileSuite, A_handler_may_close_and_connect_again_in_each_event) {
  const auto first = Connected();
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) { ConnectAgain(index); };
  first->Send("data");
  const auto second = NextConnection();
  ASSERT_TRUE(UntilState(1, sckConnected));
  EXPECT_EQ(program->BytesReceived(1), 0);

  program->Events.CloseSck = [&](const Variant& index) { ConnectAgain(index); };
  second->Close();
  const auto third = NextConnection();
  ASSERT_TRUE(UntilState(1, sckConnected));

  program->Events.Error = [&](const Variant& index, auto&&...) { ConnectAgain(index); };
  third->Reset();
  const auto fourth = NextConnection();
  ASSERT_TRUE(UntilState(1, sckConnected));

  program->Events.SendProgress = [&](const Variant& index, std::int32_t, std::int32_t) {
    ConnectAgain(index);
  };
  program->SendData(1, Text(u"data"));
  EXPECT_EQ(program->State(1), sckConnecting);
  const auto fifth = NextConnection();
  ASSERT_TRUE(UntilState(1, sckConnected));

  program.Record(*program);
  program->Events.SendComplete = [&](const Variant& index) { ConnectAgain(index); };
  program->SendData(1, Text(u"data"));
  const auto sixth = NextConnection();
  ASSERT_TRUE(UntilState(1, sckConnected));
  sixth->Send("hi");
  EXPECT_TRUE(program.Until("DataArrival 1 2"));
  EXPECT_EQ(program.module.SocketCount(), 1);
}

TEST_P(HostileSuite, A_handler_may_remove_its_index_and_add_it_again_in_each_event) {
  const auto again = [&](const Variant& index, auto&&...) {
    program->ArrayAdd(program->ArrayRemove(index));
    program->SetLocalPort(index, 0);
  };
  for (int event = 0; event < 5; ++event) {
    program.Record(*program);
    const auto far = Connected(event);
    if (event == 0) program->Events.DataArrival = again;
    if (event == 1) program->Events.CloseSck = again;
    if (event == 2) program->Events.Error = again;
    if (event == 3) program->Events.SendProgress = again;
    if (event == 4) program->Events.SendComplete = again;
    if (event == 0) far->Send("data");
    if (event == 1) far->Close();
    if (event == 2) far->Reset();
    if (event >= 3) program->SendData(event, Text(u"data"));
    ASSERT_TRUE(UntilState(event, sckClosed)) << event;
    program.Record(*program);
    program->Connect(event, Text(u"127.0.0.1"), server->Port());
    EXPECT_TRUE(UntilState(event, sckConnected)) << event;
    const auto next = NextConnection();
    program->ArrayRemove(event);
  }
  EXPECT_EQ(program->ArrayCount(), 0);
  EXPECT_EQ(program.module.SocketWindow(), kNoWindow);
}

TEST_P(HostileSuite, A_handler_may_remove_the_index_that_takes_a_connection_in_the_events_of_Accept) {
  const std::int32_t port = Listening(1);
  bool closed = false;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) { program->ArrayRemove(index); };
  program->Events.CloseSck = [&](const Variant& index) {
    program->ArrayRemove(index);
    closed = true;
  };
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    const auto pending = program.module.GetAcceptClass(request);
    ASSERT_TRUE(world->Until([&] { return pending->State(Text(u"Temporal_Socket")) == sckClosing; }));
    program->ArrayAdd(2);
    program->Accept(2, request);
  };
  world->Dial(port)->Close();
  ASSERT_TRUE(world->Until([&] { return closed; }));

  const auto talker = world->Dial(port);
  talker->Send("data");
  talker->Close();
  ASSERT_TRUE(world->Until([&] { return talker->Ended() || program->ArrayCount() == 1; }));
  world->Settle();
  EXPECT_EQ(program->ArrayCount(), 1);
  EXPECT_EQ(program.module.SocketClassCount(), 1);
  EXPECT_EQ(program->State(1), sckListening);
}

TEST_P(HostileSuite, Events_that_come_while_a_handler_waits_are_raised_inside_it) {
  const auto far = Connected();
  std::string order;
  program->Events.CloseSck = [&](const Variant&) { order += "c"; };
  program->Events.DataArrival = [&](const Variant&, std::int32_t total) {
    order += "(" + std::to_string(total);
    if (total == 3) {
      far->Send("de");
      far->Close();
      EXPECT_TRUE(world->Until([&] { return order.ends_with("c"); }));
    }
    order += ")";
  };
  far->Send("abc");
  ASSERT_TRUE(world->Until([&] { return order.ends_with("c)"); }));
  EXPECT_EQ(order, "(3(5)c)");
}

TEST_P(HostileSuite, A_fault_in_a_handler_leaves_the_object_whole) {
  const auto far = Connected();
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    Variant data;
    program->GetData(index, data, DataKind::ByteArray, -1);
  };
  const auto socket = static_cast<std::uint32_t>(program->SocketHandle(1));
  far->Send("data");
  EXPECT_EQ(FaultOf([&] {
              world->Until([&] {
                program->WndProc(kNoWindow, 32769, socket, 1);
                return false;
              });
            }),
            40014);
  EXPECT_EQ(program->State(1), sckConnected);
  EXPECT_EQ(program.Take(1), "data");
}

// Ends.

TEST_P(HostileSuite, A_reset_behind_the_close_raises_nothing_more) {
  const auto far = Connected();
  far->Send("data");
  far->Close();
  ASSERT_TRUE(program.Until("CloseSck 1"));
  far->Reset();
  world->Settle();
  EXPECT_EQ(program.Events, (Events{"Connect 1", "DataArrival 1 4", "CloseSck 1"}));
  EXPECT_EQ(program->State(1), sckClosing);
  program->CloseSck(1);
  EXPECT_EQ(program->State(1), sckClosed);
}

TEST_P(HostileSuite, SendData_after_the_peers_close_is_refused_with_40006) {
  const auto far = Connected();
  far->Close();
  ASSERT_TRUE(program.Until("CloseSck 1"));
  EXPECT_EQ(FaultOf([&] { program->SendData(1, Text(u"late")); }), 40006);
  EXPECT_EQ(FaultOf([&] { program->Connect(1); }), 40020);
}

TEST_P(HostileSuite, A_reset_while_data_waits_to_go_out_is_an_Error_that_CloseSck_mends) {
  auto far = Connected();
  program->SendData(1, ByteArray(20'000'000));
  far->Reset();
  ASSERT_TRUE(UntilState(1, sckError));
  world->Settle();
  EXPECT_TRUE(program.Events.back().starts_with("Error 1 10054 ")) << program.Events.back();
  EXPECT_FALSE(program.Saw("SendComplete 1"));
  ConnectAgain(1);
  ASSERT_TRUE(UntilState(1, sckConnected));
  far = NextConnection();
  program->SendData(1, Text(u"fresh"));
  EXPECT_TRUE(UntilReceived(*far, "fresh"));
}

TEST_P(HostileSuite, A_socket_closed_while_it_connects_connects_nobody) {
  program->ArrayAdd(1);
  program->Connect(1, Text(u"127.0.0.1"), server->Port());
  program->CloseSck(1);
  world->Settle();
  EXPECT_TRUE(program.Events.empty());
  EXPECT_EQ(program->State(1), sckClosed);
  ConnectAgain(1);
  ASSERT_TRUE(program.Until("Connect 1"));
  world->Settle();
  EXPECT_EQ(program.Events, Events{"Connect 1"});
}

TEST_P(HostileSuite, An_index_removed_while_its_name_is_looked_up_does_not_answer_for_its_successor) {
  program->ArrayAdd(1);
  program->Connect(1, Text(u"localhost"), server->Port());
  program->ArrayRemove(1);
  program->ArrayAdd(1);
  world->Settle();
  EXPECT_EQ(program->State(1), sckClosed);
  EXPECT_TRUE(program.Events.empty());
  program->Connect(1, Text(u"localhost"), server->Port());
  EXPECT_TRUE(program.Until("Connect 1"));
}

// Datagrams.

TEST_P(HostileSuite, Empty_and_largest_datagrams_in_turn_all_pass) {
  OpenDatagrams(1);
  const auto far = world->OpenDatagrams();
  std::vector<std::size_t> sizes;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t total) {
    EXPECT_EQ(total, 65507);
    sizes.push_back(program.Take(index).size());
  };
  for (std::size_t round = 1; round <= 3; ++round) {
    far->SendTo(program->LocalPort(1), "");
    world->Settle();
    far->SendTo(program->LocalPort(1), std::string(65507, 'x'));
    ASSERT_TRUE(world->Until([&] { return sizes.size() == round; }));
  }
  EXPECT_EQ(sizes, std::vector<std::size_t>(3, 65507));
}

TEST_P(HostileSuite, A_flood_of_datagrams_raises_an_event_for_every_other_and_leaves_none) {
  OpenDatagrams(1);
  const auto far = world->OpenDatagrams();
  int arrived = 0;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t total) {
    ++arrived;
    EXPECT_EQ(program.Take(index).size(), static_cast<std::size_t>(total));
  };
  for (int i = 0; i < 100; ++i) far->SendTo(program->LocalPort(1), "flood");
  world->Settle();
  ASSERT_TRUE(world->Until([&] { return arrived >= 50; }));
  world->Settle();
  EXPECT_EQ(arrived, 50);
  EXPECT_EQ(program->BytesReceived(1), 0);
}

TEST_P(HostileSuite, A_handler_may_remove_close_and_end_a_datagram_socket_in_DataArrival) {
  const auto far = world->OpenDatagrams();
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) { program->ArrayRemove(index); };
  OpenDatagrams(1);
  far->SendTo(program->LocalPort(1), "one");
  far->SendTo(program->LocalPort(1), "two");
  ASSERT_TRUE(world->Until([&] { return program->ArrayCount() == 0; }));

  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    program->CloseSck(index);
    program->Bind(index);
  };
  OpenDatagrams(2);
  const std::int32_t port = program->LocalPort(2);
  far->SendTo(port, "one");
  far->SendTo(port, "two");
  ASSERT_TRUE(world->Until([&] { return program->LocalPort(2) != port; }));
  EXPECT_EQ(program->State(2), sckOpen);

  bool ended = false;
  program->Events.DataArrival = [&](const Variant&, std::int32_t) {
    program.End();
    ended = true;
  };
  far->SendTo(program->LocalPort(2), "one");
  ASSERT_TRUE(world->Until([&] { return ended; }));
  world->Settle();
  EXPECT_FALSE(world->Desktop.Ended);
  EXPECT_EQ(world->Desktop.Windows.Count(), 0);
}

TEST_P(HostileSuite, Changing_an_open_datagram_socket_to_TCP_is_refused_and_its_data_stays) {
  OpenDatagrams(1);
  EXPECT_EQ(FaultOf([&] { program->SetProtocol(1, sckTCPProtocol); }), 40020);
  EXPECT_EQ(FaultOf([&] { program->Connect(1, Text(u"127.0.0.1"), server->Port()); }), 40020);
  EXPECT_EQ(FaultOf([&] { program->Listen(1); }), 10045);
}

// Index kinds.

TEST_P(HostileSuite, A_text_and_a_number_of_the_same_digits_are_two_sockets_with_events_of_their_own) {
  const auto number = Connected(std::int16_t{1});
  const auto text = Connected(Text(u"1"));
  std::vector<Variant> arrived;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) { arrived.push_back(index); };
  text->Send("x");
  ASSERT_TRUE(world->Until([&] { return arrived.size() == 1; }));
  number->Send("y");
  ASSERT_TRUE(world->Until([&] { return arrived.size() == 2; }));
  EXPECT_EQ(arrived, (std::vector<Variant>{Text(u"1"), std::int16_t{1}}));
  EXPECT_EQ(program.Take(std::int32_t{1}), "y");
  program->ArrayRemove(std::int32_t{1});
  EXPECT_EQ(program.Take(Text(u"1")), "x");
  EXPECT_EQ(program->ArrayCount(), 1);
}

} // namespace
} // namespace quendra::foundation

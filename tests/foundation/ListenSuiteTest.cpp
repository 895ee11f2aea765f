#include "foundation/SocketSuite.h"

namespace quendra::foundation {
namespace {

class ListenSuite : public SocketSuite {};

QUENDRA_OVER_BOTH_NETWORKS(ListenSuite);

TEST_P(ListenSuite, A_connection_that_nobody_takes_is_closed) {
  const std::int32_t port = Listening(1);
  const auto far = world->Dial(port);
  ASSERT_TRUE(program.Until("ConnectionRequest 1"));
  EXPECT_TRUE(world->Until([&] { return far->Ended(); }));
  EXPECT_EQ(program->State(1), sckListening);
  EXPECT_EQ(program.module.SocketClassCount(), 1);
}

TEST_P(ListenSuite, A_connection_taken_by_another_index_is_connected_and_talks) {
  const std::int32_t port = Listening(1);
  program->ArrayAdd(2);
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    program->Accept(2, request);
  };
  const auto far = world->Dial(port);
  ASSERT_TRUE(UntilState(2, sckConnected));
  EXPECT_EQ(program->RemoteHostIP(2), u"127.0.0.1");
  EXPECT_GT(program->RemotePort(2), 0);
  EXPECT_EQ(program->LocalPort(2), port);
  far->Send("hi");
  ASSERT_TRUE(program.Until("DataArrival 2 2"));
  program->SendData(2, Text(u"ho"));
  EXPECT_TRUE(UntilReceived(*far, "ho"));
}

TEST_P(ListenSuite, The_listener_tells_its_peer_while_the_request_is_raised_and_then_what_it_held_before) {
  const std::int32_t port = Listening(1);
  program->SetTag(1, u"tag");
  Text address;
  std::int32_t remotePort = 0;
  program->Events.ConnectionRequest = [&](const Variant& index, platform::SocketHandle) {
    address = program->RemoteHostIP(index);
    remotePort = program->RemotePort(index);
  };
  const auto far = world->Dial(port);
  ASSERT_TRUE(world->Until([&] { return remotePort != 0; }));
  EXPECT_EQ(address, u"127.0.0.1");
  EXPECT_EQ(program->RemoteHostIP(1), u"");
  EXPECT_EQ(program->RemotePort(1), 0);
}

TEST_P(ListenSuite, The_listener_itself_may_be_closed_and_take_the_connection) {
  const std::int32_t port = Listening(1);
  program->Events.ConnectionRequest = [&](const Variant& index, platform::SocketHandle request) {
    program->CloseSck(index);
    program->Accept(index, request);
  };
  const auto far = world->Dial(port);
  ASSERT_TRUE(UntilState(1, sckConnected));
  EXPECT_EQ(program->RemoteHostIP(1), u"127.0.0.1");
  far->Send("hi");
  EXPECT_TRUE(program.Until("DataArrival 1 2"));
}

TEST_P(ListenSuite, Data_that_comes_before_Accept_waits_in_the_pending_list) {
  const std::int32_t port = Listening(1);
  program->ArrayAdd(2);
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    ASSERT_TRUE(world->Until([&] {
      return program.module.GetAcceptClass(request)->BytesReceived(Text(u"Temporal_Socket")) == 5;
    }));
    program->Accept(2, request);
  };
  const auto far = world->Dial(port);
  far->Send("early");
  ASSERT_TRUE(program.Until("DataArrival 2 5"));
  EXPECT_EQ(program.Take(2), "early");
  far->Send("late");
  ASSERT_TRUE(program.Until("DataArrival 2 4"));
}

TEST_P(ListenSuite, A_peer_that_closes_before_Accept_is_told_behind_its_data) {
  const std::int32_t port = Listening(1);
  program->ArrayAdd(2);
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    ASSERT_TRUE(world->Until([&] {
      return program.module.GetAcceptClass(request)->State(Text(u"Temporal_Socket")) == sckClosing;
    }));
    program->Accept(2, request);
  };
  const auto far = world->Dial(port);
  far->Send("bye");
  far->Close();
  ASSERT_TRUE(program.Until("CloseSck 2"));
  EXPECT_EQ(program.Events, (std::vector<std::string>{"DataArrival 2 3", "CloseSck 2"}));
  EXPECT_EQ(program->State(2), sckClosing);
}

TEST_P(ListenSuite, A_peer_that_closes_before_it_is_looked_at_is_told_all_the_same) {
  const std::int32_t port = Listening(1);
  program->ArrayAdd(2);
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    program->Accept(2, request);
  };
  world->Dial(port)->Close();
  ASSERT_TRUE(program.Until("CloseSck 2"));
}

TEST_P(ListenSuite, A_peer_that_resets_before_it_is_looked_at_is_offered_with_its_address_and_then_an_Error) {
  const std::int32_t port = Listening(1);
  program->ArrayAdd(2);
  Text address;
  program->Events.ConnectionRequest = [&](const Variant& index, platform::SocketHandle request) {
    address = program->RemoteHostIP(index);
    program->Accept(2, request);
  };
  const auto far = world->Dial(port);
  far->Send("bye");
  far->Reset();
  ASSERT_TRUE(program.Until("Error 2 10054 CSocketPlus.PostSocket"));
  EXPECT_EQ(program.Events,
            (std::vector<std::string>{"DataArrival 2 3", "Error 2 10054 CSocketPlus.PostSocket"}));
  EXPECT_EQ(address, u"127.0.0.1");
  EXPECT_EQ(program->RemoteHostIP(2), u"127.0.0.1");
  EXPECT_EQ(program->State(1), sckListening);
}

TEST_P(ListenSuite, A_reset_that_only_the_pending_list_saw_is_told_by_the_next_send) {
  const std::int32_t port = Listening(1);
  program->ArrayAdd(2);
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    ASSERT_TRUE(world->Until(
        [&] { return program.module.GetAcceptClass(request)->State(Text(u"Temporal_Socket")) == sckError; }));
    program->Accept(2, request);
  };
  const auto far = world->Dial(port);
  far->Send("bye");
  far->Reset();
  ASSERT_TRUE(program.Until("DataArrival 2 3"));
  world->Settle();
  EXPECT_EQ(program->State(2), sckConnected);
  EXPECT_EQ(program.Take(2), "bye");
  program->SendData(2, Text(u"x"));
  EXPECT_EQ(program.Events.back(), "Error 2 10054 CSocketPlus.SendBufferedData");
}

TEST_P(ListenSuite, A_socket_of_the_program_connects_to_another_of_it) {
  const std::int32_t port = Listening(1);
  program->ArrayAdd(2);
  program->ArrayAdd(3);
  program->Events.ConnectionRequest = [&](const Variant&, platform::SocketHandle request) {
    program->Accept(2, request);
  };
  program->Connect(3, Text(u"127.0.0.1"), port);
  ASSERT_TRUE(
      world->Until([&] { return program->State(2) == sckConnected && program->State(3) == sckConnected; }));
  program->SendData(3, Text(u"there"));
  ASSERT_TRUE(program.Until("DataArrival 2 5"));
  program->SendData(2, Text(u"back"));
  ASSERT_TRUE(program.Until("DataArrival 3 4"));
  program->CloseSck(2);
  // Data that nobody took is still in the class, not in the system: the close is an orderly one.
  EXPECT_TRUE(program.Until("CloseSck 3"));
}

TEST_P(ListenSuite, Two_listeners_on_one_port_are_refused_with_10048) {
  const std::int32_t port = Listening(1);
  program->ArrayAdd(2);
  EXPECT_EQ(FaultOf([&] { program->Bind(2, port); }), 10048);
}

TEST_P(ListenSuite, A_bound_socket_is_open_and_tells_its_port) {
  program->ArrayAdd(1);
  program->Bind(1, 0, Text(u"127.0.0.1"));
  EXPECT_EQ(program->State(1), sckOpen);
  EXPECT_GT(program->LocalPort(1), 0);
  program->Listen(1);
  EXPECT_EQ(program->State(1), sckListening);
}

} // namespace
} // namespace quendra::foundation

#include "foundation/SocketSuite.h"

namespace quendra::foundation {
namespace {

class DatagramSuite : public SocketSuite {
 protected:
  DatagramSuite() {
    program->ArrayAdd(1);
    program->SetProtocol(1, sckUDPProtocol);
  }
  void Open() {
    program->Bind(1);
    ASSERT_EQ(program->State(1), sckOpen);
  }
  std::unique_ptr<FarDatagrams> far = world->OpenDatagrams();
};

QUENDRA_OVER_BOTH_NETWORKS(DatagramSuite);

TEST_P(DatagramSuite, Connect_only_opens_a_datagram_socket) {
  program->Connect(1, Text(u"127.0.0.1"), far->Port());
  EXPECT_EQ(program->State(1), sckOpen);
  EXPECT_EQ(program->RemoteHost(1), u"127.0.0.1");
  world->Settle();
  EXPECT_TRUE(program.Events.empty());
}

TEST_P(DatagramSuite, A_datagram_goes_to_the_host_and_port_that_stand_there_now) {
  program->SetRemoteHost(1, u"localhost");
  program->SetRemotePort(1, far->Port());
  program->SendData(1, Text(u"one"));
  EXPECT_EQ(program->State(1), sckOpen);
  const auto other = world->OpenDatagrams();
  program->SetRemotePort(1, other->Port());
  program->SendData(1, Text(u"two"));
  ASSERT_TRUE(world->Until([&] { return other->Received().size() == 1; }));
  EXPECT_EQ(far->Received(), std::vector<std::string>{"one"});
  EXPECT_EQ(other->Received(), std::vector<std::string>{"two"});
  EXPECT_TRUE(program.Events.empty());
}

TEST_P(DatagramSuite, A_datagram_that_is_taken_leaves_its_sender_in_the_remote_fields) {
  Open();
  program->SetRemoteHost(1, u"old");
  std::string taken;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t total) {
    EXPECT_EQ(total, 4);
    EXPECT_EQ(program->BytesReceived(index), 4);
    taken = program.Take(index);
  };
  far->SendTo(program->LocalPort(1), "ping");
  ASSERT_TRUE(world->Until([&] { return taken == "ping"; }));
  EXPECT_EQ(program->RemotePort(1), far->Port());
  EXPECT_EQ(program->RemoteHostIP(1), u"127.0.0.1");
  EXPECT_EQ(program->RemoteHost(1), u"");
}

TEST_P(DatagramSuite, A_peek_leaves_the_datagram) {
  Open();
  std::vector<Variant> seen;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    for (const bool peek : {true, false}) {
      Variant data = Text();
      peek ? program->PeekData(index, data) : program->GetData(index, data);
      seen.push_back(data);
    }
  };
  far->SendTo(program->LocalPort(1), "look");
  ASSERT_TRUE(world->Until([&] { return !seen.empty(); }));
  EXPECT_EQ(seen, (std::vector<Variant>{Text(u"look"), Text(u"look")}));
}

TEST_P(DatagramSuite, A_datagram_that_the_handler_leaves_is_dropped) {
  Open();
  far->SendTo(program->LocalPort(1), "unread");
  ASSERT_TRUE(program.Until("DataArrival 1 6"));
  EXPECT_EQ(program->BytesReceived(1), 0);
  far->SendTo(program->LocalPort(1), "next one");
  ASSERT_TRUE(program.Until("DataArrival 1 8"));
}

TEST_P(DatagramSuite, A_datagram_behind_one_that_was_taken_is_dropped_with_its_event) {
  Open();
  std::vector<std::string> taken;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    taken.push_back(program.Take(index));
  };
  far->SendTo(program->LocalPort(1), "first");
  far->SendTo(program->LocalPort(1), "second");
  far->SendTo(program->LocalPort(1), "third");
  ASSERT_TRUE(world->Until([&] { return taken.size() == 2; }));
  EXPECT_EQ(taken, (std::vector<std::string>{"first", "third"}));
}

TEST_P(DatagramSuite, An_empty_datagram_raises_no_event_and_is_dropped) {
  Open();
  far->SendTo(program->LocalPort(1), "");
  far->SendTo(program->LocalPort(1), "x");
  ASSERT_TRUE(program.Until("DataArrival 1 1"));
  EXPECT_EQ(program.Events.size(), 1u);
}

TEST_P(DatagramSuite, A_maximum_below_the_datagrams_length_raises_10040_and_the_datagram_is_gone) {
  Open();
  int fault = 0;
  std::int32_t left = -1;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    Variant data;
    fault = FaultOf([&] { program->GetData(index, data, DataKind::ByteArray, 3); });
    left = program->BytesReceived(index);
  };
  far->SendTo(program->LocalPort(1), "too long");
  ASSERT_TRUE(world->Until([&] { return fault != 0; }));
  EXPECT_EQ(fault, 10040);
  EXPECT_EQ(left, 0);
}

TEST_P(DatagramSuite, A_maximum_of_0_empties_the_data_drops_the_datagram_and_raises_10040) {
  Open();
  int fault = 0;
  std::int32_t left = -1;
  Variant data = Text(u"before");
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    fault = FaultOf([&] { program->PeekData(index, data, DataKind::None, 0); });
    left = program->BytesReceived(index);
  };
  far->SendTo(program->LocalPort(1), "gone");
  ASSERT_TRUE(world->Until([&] { return fault != 0; }));
  EXPECT_EQ(fault, 10040);
  EXPECT_EQ(left, 0);
  EXPECT_EQ(data, Variant(Text()));
}

TEST_P(DatagramSuite, GetData_with_nothing_waiting_leaves_the_variable_alone) {
  Open();
  Variant data = Text(u"before");
  program->GetData(1, data, DataKind::None, 0);
  EXPECT_EQ(data, Variant(Text(u"before")));
}

TEST_P(DatagramSuite, A_datagram_above_the_largest_raises_Error_10040_and_keeps_nothing_to_send) {
  program->SetRemoteHost(1, u"127.0.0.1");
  program->SetRemotePort(1, far->Port());
  program->SendData(1, ByteArray(65508));
  EXPECT_EQ(program.Events, std::vector<std::string>{"Error 1 10040 CSocketPlus.SendBufferedDataUDP"});
  EXPECT_EQ(program->State(1), sckError);
}

TEST_P(DatagramSuite, The_largest_datagram_passes) {
  program->SetRemoteHost(1, u"127.0.0.1");
  program->SetRemotePort(1, far->Port());
  program->SendData(1, ByteArray(65507));
  ASSERT_TRUE(world->Until([&] { return far->Received().size() == 1; }));
  EXPECT_EQ(far->Received()[0].size(), 65507u);
}

TEST_P(DatagramSuite, Two_sockets_of_the_program_talk_over_datagrams) {
  Open();
  program->ArrayAdd(2);
  program->SetProtocol(2, sckUDPProtocol);
  program->SetRemoteHost(2, u"127.0.0.1");
  program->SetRemotePort(2, program->LocalPort(1));
  std::string taken;
  program->Events.DataArrival = [&](const Variant& index, std::int32_t) {
    taken = program.Take(index);
    if (index == Variant(1)) {
      program->SetRemoteHost(1, u"127.0.0.1");
      program->SendData(1, Text(u"answer"));
    }
  };
  program->SendData(2, Text(u"question"));
  EXPECT_TRUE(world->Until([&] { return taken == "answer"; }));
}

} // namespace
} // namespace quendra::foundation

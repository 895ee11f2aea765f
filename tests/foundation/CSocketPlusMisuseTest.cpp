#include "foundation/SimulatedWorld.h"

namespace quendra::foundation {
namespace {

const std::string kWrongState =
    "40006 Wrong protocol or connection state for the requested transaction or request ";
const std::string kOutOfRange =
    "40014 The argument passed to a function was not in the correct format or in the specified range. ";
const std::string kUnsupported = "40018 Unsupported variant type. ";
const std::string kAtState = "40020 Invalid operation at current state ";

using SocketMisuses = SocketTest;

// 40006.

TEST_F(SocketMisuses, SendData_needs_a_connection) {
  Add(1);
  EXPECT_EQ(FaultText([&] { Object->SendData(1, Text(u"x")); }), kWrongState + "[CSocketPlus.SendData]");
}

TEST_F(SocketMisuses, GetData_and_PeekData_need_a_connection) {
  Add(1);
  Variant data;
  EXPECT_EQ(FaultText([&] { Object->GetData(1, data); }), kWrongState + "[CSocketPlus.GetData]");
  EXPECT_EQ(FaultText([&] { Object->PeekData(1, data); }), kWrongState + "[CSocketPlus.PeekData]");
}

TEST_F(SocketMisuses, GetData_and_PeekData_of_datagrams_need_an_open_socket) {
  Add(1, sckUDPProtocol);
  Variant data;
  EXPECT_EQ(FaultText([&] { Object->GetData(1, data); }), kWrongState + "[CSocketPlus.GetData]");
  EXPECT_EQ(FaultText([&] { Object->PeekData(1, data); }), kWrongState + "[CSocketPlus.PeekData]");
}

TEST_F(SocketMisuses, Accept_refuses_a_socket_that_an_object_holds_already) {
  Connect(1);
  Add(2);
  const auto held = static_cast<platform::SocketHandle>(Object->SocketHandle(1));
  EXPECT_EQ(FaultText([&] { Object->Accept(2, held); }), kWrongState + "[CSocketPlus.Accept]");
  EXPECT_EQ(Object->SocketHandle(2), -1);
  EXPECT_EQ(Object->State(2), sckClosed);
  EXPECT_EQ(Object->State(1), sckConnected);
}

// 40014.

TEST_F(SocketMisuses, RemotePort_takes_0_to_65535) {
  Add(1);
  Object->SetRemotePort(1, 0);
  EXPECT_EQ(Object->RemotePort(1), 0);
  Object->SetRemotePort(1, 65535);
  EXPECT_EQ(Object->RemotePort(1), 65535);
  EXPECT_EQ(FaultText([&] { Object->SetRemotePort(1, -1); }), kOutOfRange + "[CSocketPlus.RemotePort]");
  EXPECT_EQ(FaultText([&] { Object->SetRemotePort(1, 65536); }), kOutOfRange + "[CSocketPlus.RemotePort]");
  EXPECT_EQ(Object->RemotePort(1), 65535);
}

TEST_F(SocketMisuses, LocalPort_takes_0_to_65535) {
  Add(1);
  Object->SetLocalPort(1, 65535);
  EXPECT_EQ(Object->LocalPort(1), 65535);
  EXPECT_EQ(FaultText([&] { Object->SetLocalPort(1, -1); }), kOutOfRange + "[CSocketPlus.LocalPort]");
  EXPECT_EQ(FaultText([&] { Object->SetLocalPort(1, 65536); }), kOutOfRange + "[CSocketPlus.LocalPort]");
}

TEST_F(SocketMisuses, Connect_takes_ports_1_to_65535_of_any_numeric_type) {
  Add(1);
  for (const Variant& port :
       {Variant(0), Variant(-1), Variant(65536), Variant(1e12), Variant(65535.5), Variant(Text(u"0"))})
    EXPECT_EQ(FaultText([&] { Object->Connect(1, Text(u"10.1.1.1"), port); }),
              kOutOfRange + "[CSocketPlus.Connect]");
  Object->Connect(1, Text(u"10.1.1.1"), Text(u" 80 "));
  EXPECT_EQ(Object->RemotePort(1), 80);
}

TEST_F(SocketMisuses, A_refused_port_leaves_the_host_stored_and_the_state_closed) {
  Add(1);
  FaultText([&] { Object->Connect(1, Text(u"10.1.1.1"), 0); });
  EXPECT_EQ(Object->RemoteHost(1), u"10.1.1.1");
  EXPECT_EQ(Object->State(1), sckClosed);
  EXPECT_EQ(Object->SocketHandle(1), -1);
}

TEST_F(SocketMisuses, Bind_takes_ports_0_to_65535) {
  Add(1);
  EXPECT_EQ(FaultText([&] { Object->Bind(1, -1); }), kOutOfRange + "[CSocketPlus.BindInternal]");
  EXPECT_EQ(FaultText([&] { Object->Bind(1, 65536); }), kOutOfRange + "[CSocketPlus.BindInternal]");
  Object->Bind(1, 65535);
  EXPECT_EQ(Object->LocalPort(1), 65535);
}

TEST_F(SocketMisuses, A_maximum_below_0_is_out_of_range) {
  Connect(1);
  Variant data;
  EXPECT_EQ(FaultText([&] { Object->GetData(1, data, DataKind::None, -1); }),
            kOutOfRange + "[CSocketPlus.GetData]");
  EXPECT_EQ(FaultText([&] { Object->PeekData(1, data, DataKind::None, -1.0); }),
            kOutOfRange + "[CSocketPlus.PeekData]");
}

TEST_F(SocketMisuses, Bind_to_an_address_that_can_not_be_found_is_an_invalid_argument) {
  Add(1);
  EXPECT_EQ(FaultText([&] { Object->Bind(1, 0, Text(u"nowhere")); }),
            "40014 Invalid argument [CSocketPlus.BindInternal]");
}

TEST_F(SocketMisuses, A_datagram_to_a_host_that_can_not_be_found_is_an_invalid_argument_and_is_lost) {
  Add(1, sckUDPProtocol);
  Object->SetRemoteHost(1, u"nowhere");
  EXPECT_EQ(FaultText([&] { Object->SendData(1, Text(u"x")); }),
            "40014 Invalid argument [CSocketPlus.SendBufferedDataUDP]");
  Object->SetRemoteHost(1, u"10.1.1.1");
  Object->SetRemotePort(1, 53);
  Object->SendData(1, Text(u"y"));
  ASSERT_EQ(Net().Datagrams().size(), 1u);
  EXPECT_EQ(Net().Datagrams()[0].bytes, "y");
}

TEST_F(SocketMisuses, A_datagram_to_a_host_of_another_family_raises_that_error_itself) {
  Add(1, sckUDPProtocol);
  Object->SetRemoteHost(1, u"nowhere");
  World.Machine.hostNames.Error = 10047;
  EXPECT_EQ(FaultText([&] { Object->SendData(1, Text(u"x")); }),
            "10047 Address family not supported by protocol family. [CSocketPlus.SendBufferedDataUDP]");
}

// 40018.

TEST_F(SocketMisuses, Connect_refuses_a_port_that_is_not_numeric) {
  Add(1);
  for (const Variant& port :
       {Variant(Text(u"http")), Variant(Null()), Variant(BytesFrom("80")), Variant(Date{80})})
    EXPECT_EQ(FaultText([&] { Object->Connect(1, Text(u"10.1.1.1"), port); }),
              kUnsupported + "[CSocketPlus.Connect]");
}

TEST_F(SocketMisuses, Bind_refuses_a_port_that_is_not_numeric) {
  Add(1);
  EXPECT_EQ(FaultText([&] { Object->Bind(1, Text(u"http")); }), kUnsupported + "[CSocketPlus.BindInternal]");
}

TEST_F(SocketMisuses, SendData_refuses_values_that_have_no_bytes) {
  Connect(1);
  for (const Variant& data : {Variant(), Variant(Null())})
    EXPECT_EQ(FaultText([&] { Object->SendData(1, data); }), kUnsupported + "[CSocketPlus.SendData]");
}

TEST_F(SocketMisuses, GetData_refuses_types_that_no_data_is_read_into) {
  Connect(1);
  Variant data = Null();
  EXPECT_EQ(FaultText([&] { Object->GetData(1, data); }), kUnsupported + "[CSocketPlus.RecvData]");
  data = {};
  EXPECT_EQ(FaultText([&] { Object->PeekData(1, data, DataKind::Other); }),
            kUnsupported + "[CSocketPlus.RecvData]");
}

// 40020.

TEST_F(SocketMisuses, A_connected_socket_refuses_new_ports_host_and_protocol) {
  Connect(1);
  EXPECT_EQ(FaultText([&] { Object->SetRemotePort(1, 81); }), kAtState + "[CSocketPlus.RemotePort]");
  EXPECT_EQ(FaultText([&] { Object->SetRemoteHost(1, u"x"); }), kAtState + "[CSocketPlus.RemoteHost]");
  EXPECT_EQ(FaultText([&] { Object->SetLocalPort(1, 81); }), kAtState + "[CSocketPlus.LocalPort]");
  EXPECT_EQ(FaultText([&] { Object->SetProtocol(1, sckUDPProtocol); }), kAtState + "[CSocketPlus.Protocol]");
}

TEST_F(SocketMisuses, An_open_datagram_socket_takes_a_new_remote_end_but_no_new_port_or_protocol) {
  Add(1, sckUDPProtocol);
  Object->Bind(1);
  Object->SetRemotePort(1, 81);
  Object->SetRemoteHost(1, u"x");
  EXPECT_EQ(Object->RemotePort(1), 81);
  EXPECT_EQ(FaultText([&] { Object->SetLocalPort(1, 81); }), kAtState + "[CSocketPlus.LocalPort]");
  EXPECT_EQ(FaultText([&] { Object->SetProtocol(1, sckTCPProtocol); }), kAtState + "[CSocketPlus.Protocol]");
}

TEST_F(SocketMisuses, Connect_and_Bind_need_a_closed_socket) {
  Add(1);
  Object->Bind(1);
  EXPECT_EQ(FaultText([&] { Object->Bind(1); }), kAtState + "[CSocketPlus.Bind]");
  EXPECT_EQ(FaultText([&] { Object->Connect(1, Text(u"10.1.1.1"), 80); }),
            kAtState + "[CSocketPlus.Connect]");
}

TEST_F(SocketMisuses, Accept_needs_a_closed_socket) {
  Connect(1);
  EXPECT_EQ(FaultText([&] { Object->Accept(1, platform::SocketHandle(5)); }),
            kAtState + "[CSocketPlus.Accept]");
}

TEST_F(SocketMisuses, Listen_needs_a_closed_or_an_open_socket) {
  Connect(1);
  EXPECT_EQ(FaultText([&] { Object->Listen(1); }), kAtState + "[CSocketPlus.Listen]");
  Add(2);
  Object->Bind(2);
  Object->Listen(2);
  EXPECT_EQ(Object->State(2), sckListening);
  EXPECT_EQ(FaultText([&] { Object->Listen(2); }), kAtState + "[CSocketPlus.Listen]");
}

TEST_F(SocketMisuses, A_failed_socket_takes_no_Connect_until_it_is_closed) {
  Add(1);
  Server.Refuse();
  Object->Connect(1, Text(u"10.1.1.1"), 80);
  Settle();
  EXPECT_EQ(FaultText([&] { Object->Connect(1); }), kAtState + "[CSocketPlus.Connect]");
  Object->CloseSck(1);
  EXPECT_EQ(FaultText([&] { Object->Connect(1); }), "");
}

// What is allowed.

TEST_F(SocketMisuses, A_null_host_is_an_empty_text) {
  Add(1);
  Object->SetRemoteHost(1, u"old");
  Object->Connect(1, Null(), 80);
  EXPECT_EQ(Object->RemoteHost(1), u"");
}

TEST_F(SocketMisuses, A_host_that_is_a_number_is_its_text) {
  Add(1);
  Object->Connect(1, std::int32_t{167772161}, 80);
  EXPECT_EQ(Object->RemoteHost(1), u"167772161");
}

TEST_F(SocketMisuses, Connect_without_arguments_takes_what_is_stored) {
  Add(1);
  Object->SetRemoteHost(1, u"10.1.1.1");
  Object->SetRemotePort(1, 80);
  Object->Connect(1);
  Settle();
  EXPECT_EQ(Object->State(1), sckConnected);
}

TEST_F(SocketMisuses, A_host_ends_at_its_first_nul) {
  Add(1);
  Object->Connect(1, Text(u"10.1.1.1\0.evil", 14), 80);
  Settle();
  EXPECT_EQ(Object->RemoteHostIP(1), u"10.1.1.1");
}

TEST_F(SocketMisuses, A_maximum_that_is_not_numeric_takes_what_waits) {
  Connect(1);
  Peer().Send("abc");
  Settle();
  Variant data = Text();
  Object->GetData(1, data, DataKind::None, Text(u"all"));
  EXPECT_EQ(data, Variant(Text(u"abc")));
}

TEST_F(SocketMisuses, A_maximum_of_0_empties_the_data_and_leaves_the_stream) {
  Connect(1);
  Peer().Send("abc");
  Settle();
  Variant data = Text(u"before");
  Object->GetData(1, data, DataKind::None, 0);
  EXPECT_EQ(data, Variant(Text()));
  EXPECT_EQ(Object->BytesReceived(1), 3);
}

TEST_F(SocketMisuses, GetData_with_nothing_waiting_empties_texts_and_bytes) {
  Connect(1);
  Variant data = Text(u"before");
  Object->GetData(1, data);
  EXPECT_EQ(data, Variant(Text()));
  data = {};
  Object->GetData(1, data);
  EXPECT_EQ(data, Variant(ByteArray()));
}

TEST_F(SocketMisuses, The_variables_own_type_goes_before_the_type_asked_for) {
  Connect(1);
  Peer().Send("ab");
  Settle();
  Variant data = std::uint8_t{0};
  Object->GetData(1, data, DataKind::String);
  EXPECT_EQ(data, Variant(std::uint8_t{'a'}));
  EXPECT_EQ(data.Kind(), DataKind::Byte);
  data = {};
  Object->GetData(1, data, DataKind::String);
  EXPECT_EQ(data, Variant(Text(u"b")));
}

TEST_F(SocketMisuses, Bytes_received_of_a_socket_that_was_never_opened_are_0) {
  Add(1);
  Add(2, sckUDPProtocol);
  EXPECT_EQ(Object->BytesReceived(1), 0);
  EXPECT_EQ(Object->BytesReceived(2), 0);
}

} // namespace
} // namespace quendra::foundation

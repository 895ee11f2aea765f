#include "platform/BehaviourFixture.h"
#include "platform/net/InterfaceRow.h"

namespace quendra::platform {

// Sockets and their owners.

TEST_P(BehaviourTest, A_listening_socket_stands_in_the_owner_table_as_it_lies_in_memory) {
  const std::uint16_t port = backend->Listen();

  const auto listening = Find(port, 0);

  ASSERT_TRUE(listening);
  EXPECT_EQ(listening->state, 2U);
  EXPECT_EQ(listening->localAddress, kLoopbackInMemory);
  EXPECT_EQ(listening->remoteAddress, 0U);
  EXPECT_EQ(listening->owner, backend->OwnId());
}

TEST_P(BehaviourTest, Both_ends_of_a_connection_stand_in_the_owner_table) {
  const std::uint16_t server = backend->Listen();
  const std::uint16_t client = backend->Connect(server);

  for (const auto& [local, remote] : {std::pair(client, server), std::pair(server, client)}) {
    const auto end = Find(local, remote);
    ASSERT_TRUE(end) << local;
    EXPECT_EQ(end->state, 5U);
    EXPECT_EQ(end->localAddress, kLoopbackInMemory);
    EXPECT_EQ(end->remoteAddress, kLoopbackInMemory);
    EXPECT_EQ(end->owner, backend->OwnId());
  }
}

TEST_P(BehaviourTest, Every_state_in_the_owner_table_has_a_number_from_1_to_12) {
  backend->Connect(backend->Listen());

  const auto connections = OwnerTable();

  EXPECT_GE(connections.size(), 3U);
  for (const Connection& connection : connections) {
    EXPECT_TRUE(connection.state >= 1 && connection.state <= 12) << connection.state;
    EXPECT_LE(connection.localPort, 0xFFFFU);
    EXPECT_LE(connection.remotePort, 0xFFFFU);
  }
}

TEST_P(BehaviourTest, A_table_once_given_stays_as_it_was) {
  backend->Listen();
  IpHelper::TcpTable first;
  ASSERT_EQ(machine.ipHelper.AllocateAndGetTcpExTableFromStack(first), 0U);
  const auto before = *first;

  backend->Listen();
  IpHelper::TcpTable second;
  ASSERT_EQ(machine.ipHelper.AllocateAndGetTcpExTableFromStack(second), 0U);

  EXPECT_EQ(*first, before);
  EXPECT_NE(first, second);
}

// Interfaces.

std::vector<std::uint8_t> InterfaceTableOf(IpHelper& ipHelper) {
  std::uint32_t size = 0;
  EXPECT_EQ(ipHelper.GetIfTable({}, size, true), IpHelper::kErrorInsufficientBuffer);
  // Room for one that comes meanwhile.
  size += InterfaceRow::kBytes;
  std::vector<std::uint8_t> table(size);
  EXPECT_EQ(ipHelper.GetIfTable(table, size, true), 0U);
  table.resize(size);
  return table;
}

TEST_P(BehaviourTest, The_interface_table_is_a_count_and_as_many_rows_by_ascending_index) {
  const auto table = InterfaceTableOf(machine.ipHelper);

  const std::uint32_t count = Little32(table, 0);
  ASSERT_EQ(table.size(), InterfaceRow::kFirstOffset + count * InterfaceRow::kBytes);
  ASSERT_GE(count, 1U);
  std::uint32_t last = 0;
  for (std::size_t at = InterfaceRow::kFirstOffset; at < table.size(); at += InterfaceRow::kBytes) {
    const std::uint32_t index = Little32(table, at + InterfaceRow::kIndex);
    EXPECT_GT(index, last);
    last = index;
    EXPECT_LE(Little32(table, at + InterfaceRow::kAddressLength), InterfaceRow::kAddressBytes);
    EXPECT_LE(Little32(table, at + InterfaceRow::kDescriptionLength), InterfaceRow::kDescriptionBytes);
  }
}

TEST_P(BehaviourTest, A_loopback_stands_in_the_interface_table) {
  const auto table = InterfaceTableOf(machine.ipHelper);
  bool found = false;
  for (std::size_t at = InterfaceRow::kFirstOffset; at < table.size(); at += InterfaceRow::kBytes)
    found = found || Little32(table, at + InterfaceRow::kType) == kLoopbackInterface;
  EXPECT_TRUE(found);
}

TEST_P(BehaviourTest, A_buffer_with_too_little_room_for_the_interface_table_stays_as_it_was) {
  const auto whole = static_cast<std::uint32_t>(InterfaceTableOf(machine.ipHelper).size());
  for (const std::uint32_t room : {whole - 1, 4U, 3U}) {
    std::vector<std::uint8_t> buffer(room, 0xA5);
    std::uint32_t size = room;
    EXPECT_EQ(machine.ipHelper.GetIfTable(buffer, size, true), IpHelper::kErrorInsufficientBuffer);
    EXPECT_GE(size, whole);
    EXPECT_EQ(buffer, std::vector<std::uint8_t>(room, 0xA5));
  }
}

TEST_P(BehaviourTest, A_stated_size_is_believed_where_the_buffer_has_more) {
  std::vector<std::uint8_t> buffer(1'000'000, 0xA5);
  std::uint32_t size = 10;
  EXPECT_EQ(machine.ipHelper.GetIfTable(buffer, size, true), IpHelper::kErrorInsufficientBuffer);
  EXPECT_EQ(buffer[0], 0xA5);
}

// Addresses.

TEST_P(BehaviourTest, The_own_name_stands_for_addresses) {
  const auto name = machine.hostNames.gethostname();
  ASSERT_TRUE(name);
  EXPECT_FALSE(name->empty());

  const auto addresses = machine.hostNames.gethostbyname(*name + std::string(1, '\0'));

  ASSERT_TRUE(addresses);
  ASSERT_FALSE(addresses->empty());
  for (const Ipv4Address address : *addresses) EXPECT_FALSE(address.IsAny());
}

TEST_P(BehaviourTest, A_question_for_a_name_that_fails_has_its_own_number_which_socket_calls_leave_alone) {
  EXPECT_FALSE(machine.hostNames.gethostbyname(std::string(300, 'x')));
  machine.sockets.WSAStartup(257);
  EXPECT_EQ(machine.sockets.listen(SocketHandle(4711), 1), kSocketError);
  machine.sockets.WSACleanup();
  EXPECT_EQ(machine.hostNames.LastError(), kHostNotFound);

  EXPECT_TRUE(machine.hostNames.gethostname());
  EXPECT_EQ(machine.hostNames.LastError(), 0);
}

TEST_P(BehaviourTest, Adapters_are_asked_for_in_two_phases) {
  std::vector<AdapterRecord> adapters;
  std::uint32_t size = 0;
  const auto first = machine.ipHelper.GetAdaptersInfo(adapters, size);
  if (first == IpHelper::kErrorBufferOverflow) {
    EXPECT_GT(size, 0U);
    EXPECT_EQ(size % IpHelper::kAdapterBytes, 0U);
    EXPECT_TRUE(adapters.empty());
  } else {
    // A machine without adapters has nothing to make room for.
    EXPECT_EQ(first, 0U);
    EXPECT_EQ(size, 0U);
  }

  EXPECT_EQ(machine.ipHelper.GetAdaptersInfo(adapters, size), 0U);

  EXPECT_EQ(adapters.size(), size / IpHelper::kAdapterBytes);
  for (const AdapterRecord& adapter : adapters) EXPECT_FALSE(adapter.name.empty());
}

} // namespace quendra::platform

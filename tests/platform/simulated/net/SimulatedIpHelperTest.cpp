#include "platform/simulated/SimulatedMachineFixture.h"

namespace quendra::platform::simulated {

TEST_F(SimulatedMachineTest, Connections_stand_in_the_table_as_they_lie_in_memory) {
  machine.AddConnection({.state = 5,
                         .localAddress = "10.0.0.7",
                         .localPort = 40000,
                         .remoteAddress = "192.168.1.254",
                         .remotePort = 80,
                         .owner = 1234});
  IpHelper::TcpTable table;

  ASSERT_EQ(operations.ipHelper.AllocateAndGetTcpExTableFromStack(table), 0U);

  EXPECT_EQ(*table, (Bytes{1, 0, 0,   0,   5, 0,   0, 0,  10, 0, 0,    7,    0x9C, 0x40,
                           0, 0, 192, 168, 1, 254, 0, 80, 0,  0, 0xD2, 0x04, 0,    0}));
}

TEST_F(SimulatedMachineTest, A_failing_table_leaves_the_one_before) {
  IpHelper::TcpTable table;
  operations.ipHelper.AllocateAndGetTcpExTableFromStack(table);
  const auto before = table;
  machine.ipHelper.TableError = IpHelper::kErrorNotSupported;

  EXPECT_EQ(operations.ipHelper.AllocateAndGetTcpExTableFromStack(table), 50U);

  EXPECT_EQ(table, before);
}

TEST_F(SimulatedMachineTest, Deleted_connections_are_kept) {
  std::array<std::uint8_t, 20> record{12};

  EXPECT_EQ(operations.ipHelper.SetTcpEntry(record), 0U);

  ASSERT_EQ(machine.ipHelper.Deleted.size(), 1U);
  EXPECT_EQ(machine.ipHelper.Deleted[0], record);
}

TEST_F(SimulatedMachineTest, A_text_that_is_no_address_is_zero) {
  for (const char* text : {"", "1.2.3", "1.2.3.256", "a.b.c.d", "1,2,3,4"})
    EXPECT_EQ(AddressOf(text), Ipv4Address()) << text;
  EXPECT_EQ(AddressOf("1.2.3.4").InMemory(), 0x04030201U);
}

TEST_F(SimulatedMachineTest, Host_names_fail_when_told_to) {
  machine.hostNames.Addresses = {"127.0.0.1"};
  EXPECT_TRUE(operations.hostNames.gethostbyname("subscriber"));
  EXPECT_FALSE(operations.hostNames.gethostbyname("other"));
  machine.hostNames.FailAddresses = true;
  machine.hostNames.FailName = true;

  EXPECT_FALSE(operations.hostNames.gethostbyname("subscriber"));
  EXPECT_FALSE(operations.hostNames.gethostname());
}

} // namespace quendra::platform::simulated

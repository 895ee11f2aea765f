#include "monitor/MonitorFixture.h"

#include <random>

namespace quendra::monitor {

namespace {

using platform::simulated::Connection;

/// Every entry against every row, as the walk is defined.
void MergePlainly(const std::vector<Connection>& connections, forms::ListView& list,
                  const mdlFileInfo& fileInfo, Text& systemPorts) {
  for (const Connection& entry : connections) {
    if (entry.localPort == 0 && entry.remotePort == 0 && entry.remoteAddress == "0.0.0.0") continue;
    for (int i = 1; i <= list.Count(); ++i) {
      forms::ListRow& row = list.Row(i);
      if (ProcessIdOfKey(row.Key()) != std::int64_t{entry.owner}) continue;
      const Text port = DecimalText(entry.localPort);
      const Text cell = row.CellText(kPortsCell);
      if (cell.find(port) != Text::npos) continue;
      row.SetCellText(kPortsCell, (cell.empty() ? Text(u".") : cell) + port + u".");
      if (fileInfo.IsSystemPid(entry.owner)) systemPorts += port;
    }
  }
}

/// Tables of few owners and many look-alike ports, so that cells grow long and ports lie inside each other.
struct RandomTables {
  explicit RandomTables(std::uint32_t seed) : random(seed) {}

  std::uint32_t Below(std::uint32_t bound) { return static_cast<std::uint32_t>(random() % bound); }
  std::uint32_t Owner() {
    constexpr std::array<std::uint32_t, 9> kOdd{0, 1, 11, 111, 32768, 65536, 70000, 0x80000000, 0xFFFFFFFF};
    return kOdd[Below(kOdd.size())];
  }
  std::uint16_t Port() {
    constexpr std::array<std::uint16_t, 10> kOdd{0, 1, 8, 80, 808, 8080, 32767, 32768, 65535, 10};
    switch (Below(4)) {
    case 0: return kOdd[Below(kOdd.size())];
    case 1: return static_cast<std::uint16_t>(Below(200));
    default: return static_cast<std::uint16_t>(Below(65536));
    }
  }
  Connection Entry() {
    const bool listens = Below(3) == 0;
    return {2,      "10.0.0.1", Port(), listens ? "0.0.0.0" : "10.0.0.2", listens ? std::uint16_t{0} : Port(),
            Owner()};
  }

  std::mt19937 random;
};

struct RandomTcpPorts : MonitorFixture, testing::WithParamInterface<std::uint32_t> {};

} // namespace

TEST_P(RandomTcpPorts, Every_cell_is_as_the_plain_walk_over_entries_and_rows_leaves_it) {
  RandomTables tables(GetParam());
  MonitorControls plain;
  fileInfo.SystemPids = {1, 70000, 0, 0, 5};
  for (int pass = 0; pass < 4; ++pass) {
    for (int i = 0; i < 3; ++i) {
      const Text key = KeyOfProcess(tables.Owner());
      if (list.Find(key)) continue;
      AddBareRow(list, key, pass == 1 ? u".12.x.034." : u"");
      AddBareRow(plain.main_ListView1, key, pass == 1 ? u".12.x.034." : u"");
    }
    machine.ipHelper.Connections.clear();
    for (std::uint32_t i = tables.Below(4000); i > 0; --i) machine.AddConnection(tables.Entry());
    procPort.FetchTcpOwnerTable();
    procPort.MergeTcpPorts();
    Text systemPorts;
    MergePlainly(machine.ipHelper.Connections, plain.main_ListView1, fileInfo, systemPorts);
    ASSERT_EQ(procPort.SystemPortsText, systemPorts);
    for (int row = 1; row <= list.Count(); ++row)
      ASSERT_EQ(list.Row(row).CellText(kPortsCell), plain.main_ListView1.Row(row).CellText(kPortsCell));
  }
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomTcpPorts, testing::Range(1u, 21u));

} // namespace quendra::monitor

#include "capture/CaptureProgram.h"

#include <random>

namespace quendra::capture {
namespace {

/// The attribution in its plain form, on texts alone: what the packets of one drain add to the rows of a
/// table.
class PlainAttribution {
 public:
  PlainAttribution(forms::ListView& rows, const OwnAddresses& addresses)
      : rows_(rows), addresses_(addresses) {}

  void Charge(const Bytes& bytes) {
    clsIP ip;
    clsTCP tcp;
    ip.Decode(FrameOf(bytes));
    tcp.Decode(FrameOf(bytes), 0, false);
    const bool outgoing = ip.SrcIP() == Trimmed(addresses_.LocalAddressLast) ||
                          ip.SrcIP() == Trimmed(addresses_.LocalAddressPrevious);
    for (int i = 1; i <= rows_.Count(); ++i) {
      const Text& ports = rows_.Row(i).CellText(monitor::kPortsCell);
      const bool sourceHit = ports.find(u"." + tcp.srcPort() + u".") != Text::npos;
      const bool destinationHit = ports.find(u"." + tcp.dstPort() + u".") != Text::npos;
      if ((!sourceHit || !outgoing) && (!destinationHit || outgoing)) continue;
      totals_[{rows_.Row(i).Key(), outgoing}] += ip.TotalLength() / 1024.0;
      return;
    }
  }
  double Total(const Text& key, bool outgoing) const {
    const auto found = totals_.find({key, outgoing});
    return found == totals_.end() ? 0 : found->second;
  }

 private:
  forms::ListView& rows_;
  const OwnAddresses& addresses_;
  std::map<std::pair<Text, bool>, double> totals_;
};

struct AttributionProperty : CaptureProgram {
  AttributionProperty() { StartCapture(); }

  int Below(int bound) { return static_cast<int>(random() % static_cast<unsigned>(bound)); }

  unsigned Port() {
    constexpr unsigned kPorts[] = {80, 8, 8080, 1025, 1026, 50000, 32767, 32768, 65535, 0, 443};
    return kPorts[Below(std::size(kPorts))];
  }
  std::string Address() {
    constexpr const char* kAddresses[] = {kOwnAddress, "192.168.7.1", kServer, "10.0.0.1", "0.0.0.0"};
    return kAddresses[Below(std::size(kAddresses))];
  }
  Bytes Packet() {
    TestFrame frame;
    frame.source = Address();
    frame.destination = Address();
    frame.sourcePort = Port();
    frame.destinationPort = Port();
    frame.totalLength = static_cast<unsigned>(Below(65536));
    return frame.Build();
  }
  Text Ports() {
    if (Below(5) == 0) return u".80";
    Text text = u".";
    for (int i = Below(5); i > 0; --i) text += DecimalText(static_cast<std::int16_t>(Port())) + u".";
    return text;
  }

  std::mt19937 random{19970204};
};

TEST_F(AttributionProperty, Every_total_of_every_row_equals_that_of_the_plain_search) {
  const Text candidates[] = {u"10.0.0.138", u" 10.0.0.138  ", u"10.0.0.0138", u"",
                             u"0.0.0.0",    u"010.0.0.138",   u"10.0.0.138.", u"266.0.0.138"};
  int charged = 0;
  for (int round = 0; round < 400; ++round) {
    form.main_ListView1.Clear();
    for (int i = Below(8); i > 0; --i) AddRow(static_cast<std::uint32_t>(i), Ports());
    addresses.LocalAddressLast = candidates[Below(std::size(candidates))];
    addresses.LocalAddressPrevious = candidates[Below(std::size(candidates))];
    PlainAttribution plain(form.main_ListView1, addresses);
    for (int i = 0; i < 40; ++i) {
      const Bytes packet = Packet();
      machine.Deliver(packet);
      plain.Charge(packet);
    }
    machine.SignalPackets();
    for (int i = 1; i <= form.main_ListView1.Count(); ++i) {
      const forms::ListRow& row = form.main_ListView1.Row(i);
      ASSERT_EQ(Upload(row), plain.Total(row.Key(), true)) << "round " << round;
      ASSERT_EQ(Download(row), plain.Total(row.Key(), false)) << "round " << round;
      charged += Upload(row) != 0;
    }
  }
  EXPECT_GT(charged, 100);
}

} // namespace
} // namespace quendra::capture

#include "capture/CaptureProgram.h"

#include "capture/mod_get_header.h"
#include "capture/mod_get_proto.h"

#include <filesystem>
#include <fstream>

namespace quendra::capture {
namespace {

std::map<std::string, Bytes> SeedsOf(const std::string& target) {
  std::map<std::string, Bytes> seeds;
  const std::filesystem::path folder =
      std::filesystem::path(QUENDRA_SOURCE_DIR) / "tests/fuzz/seeds" / target;
  for (const auto& entry : std::filesystem::directory_iterator(folder)) {
    std::ifstream file(entry.path(), std::ios::binary);
    seeds[entry.path().filename().string()] = Bytes(std::istreambuf_iterator<char>(file), {});
  }
  return seeds;
}

/// 0, or the number of the fault that the work raised.
template <typename Work> int FaultOf(const Work& work) {
  try {
    work();
    return 0;
  } catch (const Fault& fault) {
    return fault.number;
  }
}

/// Where a frame of this many bytes ends too soon for the decoders.
int ExpectedIpFault(const Bytes& frame) {
  if (frame.size() < 24) return Fault::kSubscript;
  return frame.size() < (frame[23] == 47 ? 74u : 34u) ? Fault::kSubscript : 0;
}
int ExpectedTcpFault(const Bytes& frame) { return frame.size() < 54 ? Fault::kSubscript : 0; }

TEST(SeedFrames, Cut_at_each_length_a_frame_decodes_or_raises_fault_9_where_it_ends) {
  const auto seeds = SeedsOf("decoders");
  ASSERT_GE(seeds.size(), 20u);
  for (const auto& [name, seed] : seeds) {
    for (std::size_t length = 0; length <= seed.size(); ++length) {
      const Bytes frame(seed.begin(), seed.begin() + static_cast<std::ptrdiff_t>(length));
      clsEthernet ethernet;
      clsIP ip;
      clsTCP tcp;
      EXPECT_EQ(FaultOf([&] { ethernet.Decode(FrameOf(frame)); }), 0) << name << " " << length;
      EXPECT_EQ(ethernet.TypeCodeString().empty(), length <= 22) << name << " " << length;
      EXPECT_EQ(FaultOf([&] { ip.Decode(FrameOf(frame)); }), ExpectedIpFault(frame)) << name << " " << length;
      for (const bool tunnelled : {false, true})
        EXPECT_EQ(FaultOf([&] { tcp.Decode(FrameOf(frame), 0, tunnelled); }), ExpectedTcpFault(frame))
            << name << " " << length;
    }
  }
}

TEST(SeedFrames, Cut_at_each_length_a_record_is_read_or_raises_fault_9_where_it_ends) {
  const auto seeds = SeedsOf("prereader");
  ASSERT_GE(seeds.size(), 10u);
  for (const auto& [name, seed] : seeds) {
    for (std::size_t length = 0; length <= seed.size(); ++length) {
      const Bytes record(seed.begin(), seed.begin() + static_cast<std::ptrdiff_t>(length));
      const std::size_t headerLength = length < 18 ? 0 : Little16(record, 16);
      const int expected = length < 18 || length < headerLength + 34 ? Fault::kSubscript : 0;
      EXPECT_EQ(FaultOf([&] {
                  std::int32_t index = mod_get_header::ReadCaptureHeader(FrameOf(record)).headerLength;
                  mod_get_header::ReadEthernetHeader(FrameOf(record), index);
                  mod_get_proto::ReadIpHeader(FrameOf(record), index);
                }),
                expected)
          << name << " " << length;
    }
  }
}

struct SeedFramesInTheHandler : CaptureProgram {
  SeedFramesInTheHandler() { StartCapture(); }
};

TEST_F(SeedFramesInTheHandler, Cut_at_each_length_a_frame_leaves_the_handler_able_to_charge_the_next) {
  const auto& row = AddRow(1, u".5000.");
  double charged = 0;
  for (const auto& [name, seed] : SeedsOf("decoders")) {
    for (std::size_t length = 0; length <= seed.size(); ++length) {
      machine.Deliver(Bytes(seed.begin(), seed.begin() + static_cast<std::ptrdiff_t>(length)));
      machine.Deliver(Outgoing(5000));
      for (int event = 0; event < 3; ++event) machine.SignalPackets();
      ASSERT_EQ(Upload(row), ++charged) << name << " " << length;
    }
  }
}

TEST_F(SeedFramesInTheHandler, Cut_at_each_length_a_newest_frame_ends_no_program) {
  for (const auto& [name, seed] : SeedsOf("decoders")) {
    for (std::size_t length = 0; length <= seed.size(); ++length) {
      machine.Deliver(Bytes(seed.begin(), seed.begin() + static_cast<std::ptrdiff_t>(length)));
      EXPECT_NO_THROW(machine.SignalPackets()) << name << " " << length;
    }
  }
}

} // namespace
} // namespace quendra::capture

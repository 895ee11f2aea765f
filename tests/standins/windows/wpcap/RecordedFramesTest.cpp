#include "app/windows/TestFolder.h"
#include "platform/windows/capture/StandInWpcapFixture.h"

#include <gtest/gtest.h>

#include <cstdio>

// The capture library of the tests over a recording that grows as another program writes it, in whatever
// pieces.

namespace quendra::standins {
namespace {

using Frame = std::vector<std::uint8_t>;
using Frames = std::vector<Frame>;
using platform::windows::PcapHandle;
using platform::windows::PcapHeader;

class RecordedFrames : public testing::Test {
 protected:
  RecordedFrames() {
    wpcap.script.devices.push_back({.name = "line", .description = "", .file = ToCodePage(path)});
  }
  ~RecordedFrames() override {
    if (capture != nullptr) library.close(capture);
  }

  void Open() {
    char error[platform::windows::kPcapErrorBytes] = "";
    capture = library.open_live("line", 262144, 0, 1, error);
    ASSERT_NE(capture, nullptr);
  }
  /// What the other program appends.
  void Write(const std::string& bytes) const {
    std::FILE* const file = std::fopen(ToCodePage(path).c_str(), "ab");
    std::fwrite(bytes.data(), 1, bytes.size(), file);
    std::fclose(file);
  }
  Frames Take(int most = 100) {
    Frames frames;
    const int count = library.dispatch(capture, most, Keep, reinterpret_cast<unsigned char*>(&frames));
    EXPECT_EQ(count, static_cast<int>(frames.size()));
    return frames;
  }
  static void Keep(unsigned char* frames, const PcapHeader* header, const unsigned char* bytes) {
    reinterpret_cast<Frames*>(frames)->emplace_back(bytes, bytes + header->captured);
  }

  app::windows::TestFolder folder;
  const Text path = folder.Path() + u"\\line.pcap";
  platform::windows::StandInWpcap wpcap;
  const platform::windows::WpcapLibrary library = platform::windows::StandInWpcap::Library();
  PcapHandle* capture = nullptr;
};

std::string FileHeader() { return std::string(24, 'h'); }

std::string Little(std::uint32_t number) {
  return {static_cast<char>(number), static_cast<char>(number >> 8), static_cast<char>(number >> 16),
          static_cast<char>(number >> 24)};
}

std::string HeaderOf(std::uint32_t length) { return Little(7) + Little(8) + Little(length) + Little(length); }

std::string Record(const std::string& frame) {
  return HeaderOf(static_cast<std::uint32_t>(frame.size())) + frame;
}

TEST_F(RecordedFrames, Come_once_each_and_in_their_order) {
  Open();
  EXPECT_EQ(Take(), Frames());
  Write(FileHeader());
  EXPECT_EQ(Take(), Frames());
  Write(Record("ab") + Record("c"));
  EXPECT_EQ(Take(), (Frames{{'a', 'b'}, {'c'}}));
  EXPECT_EQ(Take(), Frames());
  Write(Record("d"));
  EXPECT_EQ(Take(), (Frames{{'d'}}));
}

TEST_F(RecordedFrames, Come_at_most_as_many_as_are_wanted) {
  Open();
  Write(FileHeader() + Record("a") + Record("b") + Record("c"));
  EXPECT_EQ(Take(2), (Frames{{'a'}, {'b'}}));
  EXPECT_EQ(Take(2), (Frames{{'c'}}));
}

TEST_F(RecordedFrames, That_are_cut_anywhere_wait_for_the_rest) {
  Open();
  const std::string whole = FileHeader() + Record("abc");
  for (const char byte : whole) {
    EXPECT_EQ(Take(), Frames());
    Write({byte});
  }
  EXPECT_EQ(Take(), (Frames{{'a', 'b', 'c'}}));
}

TEST_F(RecordedFrames, Longer_than_any_frame_are_none) {
  Open();
  Write(FileHeader() + Record("a") + HeaderOf(0xFFFFFFF0) + "rest");
  EXPECT_EQ(Take(), (Frames{{'a'}}));
  EXPECT_EQ(Take(), Frames());
}

TEST_F(RecordedFrames, From_before_the_capture_are_not_of_it) {
  Write(FileHeader() + Record("before") + Record("too") + Record("cut").substr(0, 17));
  Open();
  EXPECT_EQ(Take(), Frames());
  Write("ut");
  Write(Record("after"));
  EXPECT_EQ(Take(), (Frames{{'c', 'u', 't'}, {'a', 'f', 't', 'e', 'r'}}));
}

} // namespace
} // namespace quendra::standins

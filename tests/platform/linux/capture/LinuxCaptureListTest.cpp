#include "platform/linux/capture/LinuxCaptureFixture.h"

namespace quendra::platform::linux_ {

using integration::RawLink;
using integration::RunCommand;
using integration::TcpFrame;

namespace {

using Availability = CaptureLibrary::Availability;
using Names = std::vector<std::string>;

/// A program that started when the machine had nothing but loopback, which is down.
class LinuxCaptureListTest : public LinuxCaptureFixture {
 protected:
  void SetUp() override {
    LinuxCaptureFixture::SetUp();
    if (IsSkipped()) return;
    RunCommand("ip link del qv0");
    last = capture->VBPcapInit();
  }
  /// As a page that opens sees the adapters: each index once, what it has seen already left out.
  Names List() {
    Names names;
    for (int index = 0; index <= last; ++index) {
      const std::string name = InfoOf(index).AdapterName.data();
      if (std::find(names.begin(), names.end(), name) == names.end()) names.push_back(name);
    }
    return names;
  }

  int last = -1;
};

} // namespace

TEST_F(LinuxCaptureListTest, With_no_interface_up_loopback_is_listed_and_nothing_can_be_captured) {
  EXPECT_GE(last, 0);
  EXPECT_EQ(List(), Names{"lo"});
  EXPECT_EQ(capture->availability(), Availability::NoAdapters);
}

TEST_F(LinuxCaptureListTest, A_network_that_came_after_the_start_stands_in_the_next_list) {
  List();
  RunCommand("ip link set lo up");
  AddLink("qv0", "qv1", "10.9.0.1/24");
  RunCommand("ip link set qv1 down");
  EXPECT_EQ(List(), (Names{"qv0", "lo"}));
  EXPECT_EQ(capture->availability(), Availability::Available);
}

TEST_F(LinuxCaptureListTest, A_network_that_came_after_the_start_can_be_captured_from) {
  AddLink("qv0", "qv1", "10.9.0.1/24");
  const Names names = List();
  const auto index = std::find(names.begin(), names.end(), "qv0") - names.begin();
  capture->vpSetCurrentAdapter(static_cast<std::int16_t>(index));
  capture->vpBegin(1000);
  StartControl("qv0");
  RawLink("qv1").Send(TcpFrame(1025, 80));
  WaitUntil([&] { return events > 0; }, "the frame");
  EXPECT_EQ(Drain(), 1);
}

TEST_F(LinuxCaptureListTest, The_adapter_of_a_default_route_that_came_later_is_the_first) {
  AddLink("qv0", "qv1", "10.9.0.1/24");
  EXPECT_EQ(List().front(), "qv1");
  RunCommand("ip route add default via 10.9.0.7 dev qv0");
  EXPECT_EQ(List().front(), "qv0");
}

TEST_F(LinuxCaptureListTest, Loopback_that_comes_up_during_a_session_is_captured_from) {
  List();
  capture->vpSetCurrentAdapter(0);
  capture->vpBegin(1000);
  EXPECT_EQ(capture->availability(), Availability::NoAdapters);
  RunCommand("ip link set lo up");
  WaitUntil([&] { return capture->availability() == Availability::Available; }, "loopback");
}

TEST_F(LinuxCaptureListTest, Each_index_has_an_adapter_and_spare_ones_repeat_the_last) {
  AddLink("qv0", "qv1", "10.9.0.1/24");
  EXPECT_EQ(List().size(), 2u);
  EXPECT_GT(last, 2);
  for (int index = 2; index <= last; ++index)
    EXPECT_STREQ(InfoOf(index).AdapterName.data(), InfoOf(1).AdapterName.data());
}

TEST_F(LinuxCaptureListTest, Sixteen_adapters_may_come_and_be_listed) {
  for (int i = 0; i < 8; ++i) {
    const std::string number = std::to_string(i);
    AddLink("qa" + number, "qb" + number, "10.9." + number + ".1/24");
  }
  EXPECT_EQ(List().size(), 16u);
}

TEST_F(LinuxCaptureListTest, More_adapters_than_there_are_indexes_leave_out_the_last_ones) {
  for (int i = 0; i < 10; ++i) {
    const std::string number = std::to_string(i);
    AddLink("qa" + number, "qb" + number, "10.9." + number + ".1/24");
  }
  RunCommand("ip route add default via 10.9.9.7 dev qa9");
  const Names names = List();
  EXPECT_EQ(static_cast<int>(names.size()), last + 1);
  EXPECT_EQ(names.front(), "qa9");
}

TEST_F(LinuxCaptureListTest, During_a_session_the_list_stands) {
  AddLink("qv0", "qv1", "10.9.0.1/24");
  const Names before = List();
  capture->vpSetCurrentAdapter(0);
  capture->vpBegin(1000);
  AddLink("qw0", "qw1", "10.8.0.1/24");
  RunCommand("ip route add default via 10.8.0.7 dev qw0");
  EXPECT_EQ(List(), before);
  capture->vpEnd();
  EXPECT_EQ(List().front(), "qw0");
}

} // namespace quendra::platform::linux_

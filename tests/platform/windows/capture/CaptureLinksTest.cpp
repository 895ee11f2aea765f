#include "platform/windows/capture/CaptureLinks.h"

#include "forms/headless/HeadlessDesktop.h"
#include "platform/windows/capture/LinkPoll.h"

#include <gtest/gtest.h>

#include <utility>

namespace quendra::platform::windows {

namespace {

ListedCard Card(const std::string& name, std::uint32_t index, std::uint32_t kind) {
  return {.name = name,
          .description = u"Card " + Text(name.begin(), name.end()),
          .index = index,
          .kind = kind,
          .addresses = {Ipv4Address::FromHost(0x0A000000 + index), Ipv4Address::FromHost(0x0B000000)},
          .gateways = {}};
}

InterfaceRow Row(std::uint32_t index, std::uint32_t kind, std::uint32_t oper = kOperational,
                 std::uint32_t admin = kAdminUp) {
  InterfaceRow row;
  row.Set(InterfaceRow::kIndex, index);
  row.Set(InterfaceRow::kType, kind);
  row.Set(InterfaceRow::kOperStatus, oper);
  row.Set(InterfaceRow::kAdminStatus, admin);
  return row;
}

TEST(CaptureLinks, A_card_is_a_link_with_its_first_address_and_the_loopback_is_another) {
  const auto links = CaptureLinksOf({Card("{A}", 7, kEthernetInterface)},
                                    {Row(1, kLoopbackInterface), Row(7, kEthernetInterface)}, 7);
  ASSERT_EQ(links.size(), 2u);
  EXPECT_EQ(links[0].address, Ipv4Address::FromHost(0x0A000007));
  EXPECT_EQ(links[0].description, u"Card {A}");
  EXPECT_TRUE(links[0].isUp && links[0].hasDefaultRoute && !links[0].isLoopback);
  EXPECT_EQ(links[1].index, 1u);
  EXPECT_EQ(links[1].address, Ipv4Address::FromHost(0x7F000001));
  EXPECT_TRUE(links[1].isUp && links[1].isLoopback && !links[1].hasDefaultRoute);
}

TEST(CaptureLinks, A_card_that_is_switched_off_unplugged_or_without_a_row_is_down) {
  const auto links = CaptureLinksOf(
      {Card("{A}", 2, kEthernetInterface), Card("{B}", 3, kEthernetInterface),
       Card("{C}", 4, kEthernetInterface)},
      {Row(2, kEthernetInterface, kOperational, kAdminDown), Row(3, kEthernetInterface, kDisconnected)}, 0);
  ASSERT_EQ(links.size(), 3u);
  for (const CaptureLink& link : links) EXPECT_FALSE(link.isUp) << link.name;
}

TEST(CaptureLinks, A_card_whose_packets_are_no_Ethernet_frames_and_can_not_become_such_is_left_out) {
  EXPECT_TRUE(CaptureLinksOf({Card("{A}", 2, 9)}, {Row(2, 9)}, 0).empty());
}

TEST(CaptureLinks, A_device_is_found_by_the_name_of_its_card_whatever_the_case) {
  const auto links = CaptureLinksOf({Card("{Ab}", 2, kEthernetInterface)}, {Row(2, kEthernetInterface)}, 0);
  EXPECT_EQ(LinkOfDevice(links, "\\Device\\NPF_{AB}"), &links[0]);
  EXPECT_EQ(LinkOfDevice(links, "\\Device\\NPF_{Abc}"), nullptr);
  EXPECT_EQ(LinkOfDevice(links, "{Ab}"), nullptr);
  EXPECT_EQ(LinkOfDevice(links, ""), nullptr);
}

TEST(CaptureLinks, The_dial_up_device_stands_for_the_line_that_is_up) {
  const auto links = CaptureLinksOf(
      {Card("{A}", 2, kEthernetInterface), Card("{B}", 3, kPppInterface), Card("{C}", 4, kPppInterface)},
      {Row(2, kEthernetInterface), Row(3, kPppInterface, kDisconnected), Row(4, kPppInterface, kConnected)},
      4);
  const CaptureLink* link = LinkOfDevice(links, "\\Device\\NPF_GenericDialupAdapter");
  ASSERT_TRUE(link);
  EXPECT_EQ(link->index, 4u);
}

TEST(CaptureLinks, Without_a_dialled_line_the_dial_up_device_is_no_link) {
  const auto links = CaptureLinksOf({Card("{A}", 2, kEthernetInterface)}, {Row(2, kEthernetInterface)}, 0);
  EXPECT_EQ(LinkOfDevice(links, "\\Device\\NPF_GenericDialupAdapter"), nullptr);
}

TEST(LinkPollTest, A_change_is_told_once_and_what_stays_is_not_told) {
  forms::headless::HeadlessDesktop desktop;
  std::vector<CaptureLink> links(1);
  int changes = 0;
  auto poll = std::make_unique<LinkPoll>(
      desktop, [&] { return links; }, [&] { ++changes; });
  desktop.Advance(3 * LinkPoll::kMilliseconds);
  EXPECT_EQ(changes, 0);
  links[0].address = Ipv4Address::FromHost(0x0A000001);
  desktop.Advance(3 * LinkPoll::kMilliseconds);
  EXPECT_EQ(changes, 1);
  poll.reset();
  links.clear();
  desktop.Advance(3 * LinkPoll::kMilliseconds);
  EXPECT_EQ(changes, 1);
}

TEST(LinkPollTest, A_change_and_the_return_to_what_was_are_told_once_each) {
  forms::headless::HeadlessDesktop desktop;
  const std::vector<CaptureLink> before(1);
  std::vector<CaptureLink> links = before;
  int changes = 0;
  const LinkPoll poll(
      desktop, [&] { return links; }, [&] { ++changes; });
  links.clear();
  desktop.Advance(3 * LinkPoll::kMilliseconds);
  EXPECT_EQ(changes, 1);
  links = before;
  desktop.Advance(3 * LinkPoll::kMilliseconds);
  EXPECT_EQ(changes, 2);
}

TEST(LinkPollTest, A_look_that_fails_is_no_change) {
  forms::headless::HeadlessDesktop desktop;
  std::optional<std::vector<CaptureLink>> links(1);
  int changes = 0;
  const LinkPoll poll(
      desktop, [&] { return links; }, [&] { ++changes; });
  const auto before = std::exchange(links, std::nullopt);
  desktop.Advance(3 * LinkPoll::kMilliseconds);
  links = before;
  desktop.Advance(3 * LinkPoll::kMilliseconds);
  EXPECT_EQ(changes, 0);
}

TEST(LinkPollTest, The_first_look_that_succeeds_after_none_has_is_a_change) {
  forms::headless::HeadlessDesktop desktop;
  std::optional<std::vector<CaptureLink>> links;
  int changes = 0;
  const LinkPoll poll(
      desktop, [&] { return links; }, [&] { ++changes; });
  links.emplace(1);
  desktop.Advance(3 * LinkPoll::kMilliseconds);
  EXPECT_EQ(changes, 1);
}

TEST(CaptureLinks, A_table_that_the_system_cannot_give_is_not_one_without_links) {
  IpHelperLibrary library;
  library.GetAdaptersInfo = [](IP_ADAPTER_INFO*, ULONG*) WINAPI -> DWORD { return ERROR_INVALID_DATA; };
  EXPECT_EQ(ReadCaptureLinks(library), std::nullopt);
}

TEST(LinkPollTest, It_may_end_in_what_it_calls) {
  forms::headless::HeadlessDesktop desktop;
  std::vector<CaptureLink> links(1);
  std::unique_ptr<LinkPoll> poll;
  poll = std::make_unique<LinkPoll>(
      desktop, [&] { return links; }, [&] { poll.reset(); });
  links.clear();
  desktop.Advance(2 * LinkPoll::kMilliseconds);
  EXPECT_FALSE(poll);
}

} // namespace

} // namespace quendra::platform::windows

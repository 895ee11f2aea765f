#include "diagnostics/interfaces/CIpHelper.h"

#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/net/SimulatedIpHelper.h"
#include "platform/unavailable/UnavailableIpHelper.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra::diagnostics {
namespace {

using Row = platform::InterfaceRow;

int FaultOf(const std::function<void()>& work) {
  try {
    work();
  } catch (const Fault& fault) {
    return fault.number;
  }
  return 0;
}

Row RowOfOctets(std::uint32_t in, std::uint32_t out) {
  Row row;
  row.Set(Row::kInOctets, in);
  row.Set(Row::kOutOctets, out);
  return row;
}

class CIpHelperTest : public testing::Test {
 protected:
  Row& Add(Row row = {}) { return machine.Interfaces.emplace_back(row); }
  void AddMany(int count) {
    for (int i = 1; i <= count; ++i) Add().Set(Row::kIndex, static_cast<std::uint32_t>(i));
  }
  void SetAddress(Row& row, std::vector<std::uint8_t> bytes) {
    row.Set(Row::kAddressLength, static_cast<std::uint32_t>(bytes.size()));
    bytes.resize(Row::kAddressBytes);
    std::ranges::copy(bytes, row.bytes.begin() + Row::kAddressOffset);
  }
  void SetDescription(Row& row, const std::string& text, std::uint32_t length) {
    std::ranges::copy(text, row.bytes.begin() + Row::kDescriptionOffset);
    row.Set(Row::kDescriptionLength, length);
  }
  /// The one interface of a read.
  CInterface Only() { return *helper.Interfaces()->item(1); }

  platform::simulated::SimulatedIpHelper machine;
  forms::headless::HeadlessDesktop desktop;
  CIpHelper helper{machine, desktop};
};

TEST_F(CIpHelperTest, No_rows_give_an_empty_collection_and_sums_of_0) {
  EXPECT_EQ(helper.Interfaces()->Count(), 0);
  EXPECT_EQ(helper.BytesReceived(), 0);
  EXPECT_EQ(helper.BytesSent(), 0);
}

TEST_F(CIpHelperTest, The_table_is_asked_for_twice_and_never_sorted) {
  AddMany(1);
  helper.Interfaces();
  EXPECT_EQ(machine.InterfaceCalls, (std::vector<bool>{false, false}));
}

TEST_F(CIpHelperTest, Every_32_bit_property_is_that_of_its_field) {
  Row& row = Add();
  std::uint32_t value = 1;
  for (std::size_t at = Row::kIndex; at < Row::kAddressLength; at += 4) PutLittle32(row.bytes, at, value++);
  value = 11;
  for (std::size_t at = Row::kAdminStatus; at <= Row::kOutQueueLength; at += 4)
    PutLittle32(row.bytes, at, value++);
  const CInterface read = Only();
  EXPECT_EQ(read.InterfaceIndex, 1U);
  EXPECT_EQ(read.InterfaceType, 2U);
  EXPECT_EQ(read.MaximumTransmissionUnit, 3U);
  EXPECT_EQ(read.Speed, 4U);
  EXPECT_EQ(read.AdminStatus, 11U);
  EXPECT_EQ(read.OperationalStatus, 12U);
  EXPECT_EQ(read.OctetsReceived, 14U); // 13 is the last change
  EXPECT_EQ(read.UnicastPacketsReceived, 15U);
  EXPECT_EQ(read.NonunicastPacketsReceived, 16U);
  EXPECT_EQ(read.DiscardedIncomingPackets, 17U);
  EXPECT_EQ(read.IncomingErrors, 18U);
  EXPECT_EQ(read.UnknownProtocolPackets, 19U);
  EXPECT_EQ(read.OctetsSent, 20U);
  EXPECT_EQ(read.UnicastPacketsSent, 21U);
  EXPECT_EQ(read.NonunicastPacketsSent, 22U);
  EXPECT_EQ(read.DiscardedOutgoingPackets, 23U);
  EXPECT_EQ(read.OutgoingErrors, 24U);
  EXPECT_EQ(read.OutputQueueLength, 25U);
}

TEST_F(CIpHelperTest, The_last_change_is_the_same_date_on_every_interface) {
  Add().Set(Row::kLastChange, 1);
  Add().Set(Row::kLastChange, 777);
  const auto read = helper.Interfaces();
  EXPECT_EQ(read->item(1)->LastChange, 4.0);
  EXPECT_EQ(read->item(2)->LastChange, 4.0);
}

TEST_F(CIpHelperTest, An_address_byte_of_0_has_two_digits_and_one_below_16_has_one) {
  SetAddress(Add(), {0x00, 0x0A, 0xFF});
  EXPECT_EQ(Only().AdapterAddress, u"00-A-FF");
}

TEST_F(CIpHelperTest, An_address_of_length_0_is_empty) {
  SetAddress(Add(), {});
  EXPECT_EQ(Only().AdapterAddress, u"");
}

TEST_F(CIpHelperTest, An_address_of_8_bytes_is_read_and_one_of_9_is_a_bounds_fault) {
  SetAddress(Add(), {1, 2, 3, 4, 5, 6, 7, 0x80});
  EXPECT_EQ(Only().AdapterAddress, u"1-2-3-4-5-6-7-80");
  machine.Interfaces[0].Set(Row::kAddressLength, 9);
  EXPECT_EQ(FaultOf([&] { helper.Interfaces(); }), Fault::kSubscript);
}

TEST_F(CIpHelperTest, An_address_of_negative_length_is_empty) {
  SetAddress(Add(), {1, 2, 3});
  machine.Interfaces[0].Set(Row::kAddressLength, 0xFFFFFFFF);
  EXPECT_EQ(Only().AdapterAddress, u"");
}

TEST_F(CIpHelperTest, A_description_is_cut_to_its_length_and_read_in_the_code_page) {
  SetDescription(Add(), "Card \xE0\xE1 and more", 7);
  EXPECT_EQ(Only().InterfaceDescription, u"Card אב");
}

TEST_F(CIpHelperTest, A_description_without_a_length_is_empty_and_one_beyond_the_field_is_the_whole_field) {
  SetDescription(Add(), "Card", 0);
  EXPECT_EQ(Only().InterfaceDescription, u"");
  machine.Interfaces[0].Set(Row::kDescriptionLength, 4000);
  EXPECT_EQ(Only().InterfaceDescription.size(), 256U);
}

TEST_F(CIpHelperTest, A_description_of_negative_length_is_an_invalid_call) {
  SetDescription(Add(), "Card", 0xFFFFFFFF);
  EXPECT_EQ(FaultOf([&] { helper.Interfaces(); }), Fault::kInvalidCall);
}

TEST_F(CIpHelperTest, A_name_is_512_characters_with_a_zero_after_each_letter) {
  Row& row = Add();
  row.bytes[0] = 'e';
  row.bytes[2] = '0';
  const Text name = Only().InterfaceName;
  ASSERT_EQ(name.size(), 512U);
  EXPECT_EQ(name.substr(0, 4), Text(u"e\0"
                                    u"0\0",
                                    4));
}

TEST_F(CIpHelperTest, The_sums_are_those_of_all_interfaces) {
  Add(RowOfOctets(100, 7));
  Add(RowOfOctets(20, 5));
  helper.Interfaces();
  EXPECT_EQ(helper.BytesReceived(), 120);
  EXPECT_EQ(helper.BytesSent(), 12);
}

TEST_F(CIpHelperTest, The_sums_stay_until_the_next_read) {
  Add(RowOfOctets(100, 7));
  helper.Interfaces();
  machine.Interfaces[0] = RowOfOctets(500, 600);
  EXPECT_EQ(helper.BytesReceived(), 100);
  EXPECT_EQ(helper.BytesReceived(), 100);
  helper.Interfaces();
  EXPECT_EQ(helper.BytesReceived(), 500);
  EXPECT_EQ(helper.BytesSent(), 600);
}

TEST_F(CIpHelperTest, A_sum_of_2147483647_is_held_and_one_more_is_an_overflow) {
  Add(RowOfOctets(0x7FFFFFFE, 0));
  Add(RowOfOctets(1, 0));
  helper.Interfaces();
  EXPECT_EQ(helper.BytesReceived(), 0x7FFFFFFF);
  Add(RowOfOctets(1, 0));
  EXPECT_EQ(FaultOf([&] { helper.Interfaces(); }), Fault::kOverflow);
}

TEST_F(CIpHelperTest, What_was_sent_overflows_as_what_was_received) {
  Add(RowOfOctets(0, 0x80000000));
  EXPECT_EQ(FaultOf([&] { helper.Interfaces(); }), Fault::kOverflow);
}

TEST_F(CIpHelperTest, A_table_of_39_rows_is_read) {
  AddMany(39);
  const auto read = helper.Interfaces();
  ASSERT_EQ(read->Count(), 39);
  EXPECT_EQ(read->item(39)->InterfaceIndex, 39U);
}

TEST_F(CIpHelperTest, The_40th_row_is_an_overflow_with_39_in_the_collection) {
  AddMany(40);
  for (Row& row : machine.Interfaces) row.Set(Row::kInOctets, 10);
  EXPECT_EQ(FaultOf([&] { helper.Interfaces(); }), Fault::kOverflow);
  // A row's octets are summed up just before it comes into the collection.
  EXPECT_EQ(helper.BytesReceived(), 390);
}

TEST_F(CIpHelperTest, Two_reads_give_two_collections_and_the_first_is_no_longer_held) {
  AddMany(1);
  const std::weak_ptr<CInterfaces> first = helper.Interfaces();
  const auto second = helper.Interfaces();
  EXPECT_TRUE(first.expired());
  EXPECT_EQ(second->Count(), 1);
}

TEST_F(CIpHelperTest, A_collection_that_is_put_in_is_held_until_the_next_read) {
  auto put = std::make_shared<CInterfaces>();
  const std::weak_ptr<CInterfaces> held = put;
  helper.Interfaces(std::move(put));
  EXPECT_FALSE(held.expired());
  helper.Interfaces();
  EXPECT_TRUE(held.expired());
}

TEST_F(CIpHelperTest, A_system_without_the_table_is_told_of_in_a_box) {
  machine.InterfacesError = 50;
  EXPECT_EQ(helper.Interfaces()->Count(), 0);
  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_EQ(desktop.Boxes[0].text, u"IP Helper is not supported by this system.");
  EXPECT_EQ(desktop.Boxes[0].title, u"Quendra");
  EXPECT_EQ(desktop.Boxes[0].flags, 0);
  EXPECT_EQ(machine.InterfaceCalls.size(), 1U);
}

TEST_F(CIpHelperTest, The_same_answer_to_the_second_call_is_a_failure_like_any_other) {
  AddMany(2);
  machine.InterfacesErrorWithRoom = 50;
  EXPECT_EQ(helper.Interfaces()->Count(), 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(CIpHelperTest, A_first_call_that_fails_otherwise_is_followed_by_the_second_without_room) {
  AddMany(2);
  machine.InterfacesError = 5;
  EXPECT_EQ(helper.Interfaces()->Count(), 0);
  EXPECT_EQ(machine.InterfaceCalls.size(), 2U);
  EXPECT_TRUE(desktop.Boxes.empty());
}

TEST_F(CIpHelperTest, A_read_that_fails_leaves_sums_of_0) {
  Add(RowOfOctets(100, 7));
  for (const std::uint32_t error : {5U, platform::IpHelper::kErrorNotSupported}) {
    machine.InterfacesError = 0;
    helper.Interfaces();
    ASSERT_EQ(helper.BytesReceived(), 100);
    machine.InterfacesError = error;
    helper.Interfaces();
    EXPECT_EQ(helper.BytesReceived(), 0) << error;
    EXPECT_EQ(helper.BytesSent(), 0) << error;
  }
}

TEST_F(CIpHelperTest, A_machine_that_lacks_the_table_is_such_a_system) {
  platform::unavailable::UnavailableIpHelper none;
  CIpHelper other(none, desktop);
  EXPECT_EQ(other.Interfaces()->Count(), 0);
  EXPECT_EQ(desktop.Boxes.size(), 1U);
}

TEST_F(CIpHelperTest, Any_other_failure_leaves_the_collection_empty_without_a_word) {
  AddMany(2);
  machine.InterfacesErrorWithRoom = 5;
  EXPECT_EQ(helper.Interfaces()->Count(), 0);
  EXPECT_EQ(helper.BytesReceived(), 0);
  EXPECT_TRUE(desktop.Boxes.empty());
}

/// A system whose table is these bytes.
class BytesAsTable : public platform::unavailable::UnavailableIpHelper {
 public:
  explicit BytesAsTable(std::vector<std::uint8_t> bytes) : bytes_(std::move(bytes)) {}
  std::uint32_t GetIfTable(std::span<std::uint8_t> buffer, std::uint32_t& size, bool) override {
    size = static_cast<std::uint32_t>(bytes_.size());
    if (buffer.size() < bytes_.size()) return kErrorInsufficientBuffer;
    std::ranges::copy(bytes_, buffer.begin());
    return 0;
  }

 private:
  std::vector<std::uint8_t> bytes_;
};

TEST_F(CIpHelperTest, A_table_that_ends_before_its_rows_or_its_count_do_is_a_bounds_fault) {
  std::vector<std::uint8_t> oneRow(Row::kFirstOffset + Row::kBytes);
  PutLittle32(oneRow, 0, 2);
  for (const auto& bytes : {oneRow, std::vector<std::uint8_t>(3)}) {
    BytesAsTable table(bytes);
    CIpHelper other(table, desktop);
    EXPECT_EQ(FaultOf([&] { other.Interfaces(); }), Fault::kSubscript) << bytes.size();
  }
}

TEST_F(CIpHelperTest, A_negative_number_of_rows_gives_an_empty_collection) {
  BytesAsTable table({0xFF, 0xFF, 0xFF, 0xFF});
  CIpHelper other(table, desktop);
  EXPECT_EQ(other.Interfaces()->Count(), 0);
}

TEST(CInterfacesTest, Items_are_added_counted_found_walked_and_removed) {
  CInterfaces interfaces;
  const auto first = std::make_shared<CInterface>();
  const auto second = std::make_shared<CInterface>();
  EXPECT_EQ(interfaces.add(first), first);
  interfaces.add(second);
  EXPECT_EQ(interfaces.Count(), 2);
  EXPECT_EQ(interfaces.item(2), second);
  EXPECT_EQ(interfaces.NewEnum(), (std::vector{first, second}));
  interfaces.Remove(1);
  EXPECT_EQ(interfaces.Count(), 1);
  EXPECT_EQ(interfaces.item(1), second);
}

TEST(CInterfacesTest, An_index_that_the_collection_lacks_is_a_bounds_fault) {
  CInterfaces interfaces;
  interfaces.add(std::make_shared<CInterface>());
  for (const std::int32_t index : {-1, 0, 2}) {
    EXPECT_EQ(FaultOf([&] { interfaces.item(index); }), Fault::kSubscript) << index;
    EXPECT_EQ(FaultOf([&] { interfaces.Remove(index); }), Fault::kSubscript) << index;
  }
}

} // namespace
} // namespace quendra::diagnostics

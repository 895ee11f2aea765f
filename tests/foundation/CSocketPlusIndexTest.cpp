#include "foundation/SimulatedWorld.h"

namespace quendra::foundation {
namespace {

using SocketIndexes = SocketTest;

TEST_F(SocketIndexes, A_number_and_a_text_of_the_same_digits_are_two_indexes) {
  Object->ArrayAdd(1);
  Object->ArrayAdd(Text(u"1"));
  Object->SetTag(1, u"number");
  Object->SetTag(Text(u"1"), u"text");
  EXPECT_EQ(Object->Tag(1), u"number");
  EXPECT_EQ(Object->Tag(Text(u"1")), u"text");
  EXPECT_EQ(Object->ArrayCount(), 2);
}

TEST_F(SocketIndexes, A_16_bit_and_a_32_bit_number_are_the_same_index) {
  Object->ArrayAdd(std::int16_t{7});
  EXPECT_TRUE(Object->ArrayIndexInUse(std::int32_t{7}));
  EXPECT_EQ(FaultText([&] { Object->ArrayAdd(std::int32_t{7}); }).substr(0, 3), "457");
}

TEST_F(SocketIndexes, ArrayAdd_gives_the_index_back) {
  EXPECT_EQ(Object->ArrayAdd(Text(u"mail")), Variant(Text(u"mail")));
  EXPECT_EQ(Object->ArrayAdd(-5), Variant(-5));
}

TEST_F(SocketIndexes, ArrayAdd_without_an_index_takes_the_lowest_free_number_from_1) {
  Object->ArrayAdd(2);
  Object->ArrayAdd(Text(u"1"));
  EXPECT_EQ(Object->ArrayAdd(), Variant(1));
  EXPECT_EQ(Object->ArrayAdd(), Variant(3));
  Object->ArrayRemove(1);
  EXPECT_EQ(Object->ArrayAdd(), Variant(1));
}

TEST_F(SocketIndexes, ArrayAdd_of_an_index_in_use_raises_457_and_the_count_stays) {
  Object->ArrayAdd(1);
  EXPECT_EQ(FaultText([&] { Object->ArrayAdd(1); }),
            "457 This index is already associated with an element of this array. [CSocketPlus.ArrayAdd]");
  EXPECT_EQ(Object->ArrayCount(), 1);
}

TEST_F(SocketIndexes, ArrayAdd_of_an_index_in_use_leaves_a_slot_taken_from_the_free_list) {
  Object->ArrayAdd(1);
  Object->ArrayAdd(2);
  Object->ArrayAdd(3);
  Object->ArrayRemove(1);
  FaultText([&] { Object->ArrayAdd(2); });
  // The freed slot, whose ports would read -1, is lost: the next index gets a new one.
  Object->ArrayAdd(4);
  EXPECT_EQ(Object->RemotePort(4), 0);
}

TEST_F(SocketIndexes, ArrayAdd_of_an_index_in_use_leaves_the_grown_array_behind) {
  Object->ArrayAdd(1);
  FaultText([&] { Object->ArrayAdd(1); });
  // With a slot that nobody gives back the array never counts as all free: the slot waits in the free list.
  Object->ArrayRemove(1);
  Object->ArrayAdd(2);
  EXPECT_EQ(Object->RemotePort(2), -1);
}

TEST_F(SocketIndexes, ArrayAdd_of_another_type_raises_40027) {
  for (const Variant& index : {Variant(Null()), Variant(true), Variant(std::uint8_t{1}), Variant(1.0),
                               Variant(Date{1}), Variant(Currency{1}), Variant(BytesFrom("1"))})
    EXPECT_EQ(FaultText([&] { Object->ArrayAdd(index); }),
              "40027 Unsupported index type. [CSocketPlus.ArrayAdd]");
  EXPECT_EQ(Object->ArrayCount(), 0);
}

TEST_F(SocketIndexes, ArrayIndexInUse_is_false_for_an_unknown_index) {
  EXPECT_FALSE(Object->ArrayIndexInUse(1));
  EXPECT_FALSE(Object->ArrayIndexInUse(Text(u"1")));
  Object->ArrayAdd(1);
  EXPECT_TRUE(Object->ArrayIndexInUse(1));
  EXPECT_FALSE(Object->ArrayIndexInUse(Text(u"1")));
}

TEST_F(SocketIndexes, ArrayIndexInUse_raises_40027_for_a_type_that_ArrayAdd_refuses) {
  EXPECT_EQ(FaultText([&] { Object->ArrayIndexInUse(1.0); }),
            "40027 Unsupported index type. [CSocketPlus.ArrayIndexInUse]");
}

TEST_F(SocketIndexes, An_unknown_index_raises_40029) {
  EXPECT_EQ(FaultText([&] { Object->State(1); }), "40029 Unknown index. [CSocketPlus.GetSocketIndex]");
  EXPECT_EQ(FaultText([&] { Object->State(Text(u"1")); }),
            "40029 Unknown index. [CSocketPlus.GetSocketIndex]");
}

TEST_F(SocketIndexes, An_index_of_another_type_raises_40027_when_it_is_looked_for) {
  EXPECT_EQ(FaultText([&] { Object->State(1.0); }),
            "40027 Unsupported index type. [CSocketPlus.GetSocketIndex]");
}

TEST_F(SocketIndexes, ArrayRemove_of_another_type_fails_at_the_search_for_its_slot) {
  EXPECT_EQ(FaultText([&] { Object->ArrayRemove(1.0); }),
            "40027 Unsupported index type. [CSocketPlus.GetSocketIndex]");
}

TEST_F(SocketIndexes, ArrayRemove_closes_the_socket_and_gives_the_index_back) {
  Connect(1);
  EXPECT_EQ(Object->ArrayRemove(1), Variant(1));
  EXPECT_TRUE(Peer().Ended);
  EXPECT_FALSE(Object->ArrayIndexInUse(1));
  EXPECT_EQ(Object->ArrayCount(), 0);
}

TEST_F(SocketIndexes, A_new_slot_has_ports_of_0) {
  Object->ArrayAdd(1);
  EXPECT_EQ(Object->RemotePort(1), 0);
  EXPECT_EQ(Object->LocalPort(1), 0);
  EXPECT_EQ(Object->SocketHandle(1), -1);
  EXPECT_EQ(Object->State(1), sckClosed);
  EXPECT_EQ(Object->Protocol(1), sckTCPProtocol);
}

TEST_F(SocketIndexes, A_slot_from_the_free_list_has_ports_of_minus_1_and_is_empty_otherwise) {
  Object->ArrayAdd(1);
  Object->ArrayAdd(2);
  Object->SetTag(1, u"tag");
  Object->SetRemoteHost(1, u"host");
  Object->SetProtocol(1, sckUDPProtocol);
  Object->ArrayRemove(1);
  Object->ArrayAdd(3);
  EXPECT_EQ(Object->RemotePort(3), -1);
  EXPECT_EQ(Object->LocalPort(3), -1);
  EXPECT_EQ(Object->Tag(3), u"");
  EXPECT_EQ(Object->RemoteHost(3), u"");
  EXPECT_EQ(Object->Protocol(3), sckTCPProtocol);
}

TEST_F(SocketIndexes, A_slot_from_the_free_list_binds_the_port_that_minus_1_is_in_16_bits) {
  Object->ArrayAdd(1);
  Object->ArrayAdd(2);
  Object->ArrayRemove(1);
  Object->ArrayAdd(3);
  Object->Connect(3, Text(u"10.1.1.1"), 80);
  Settle();
  EXPECT_EQ(Object->LocalPort(3), 65535);
}

TEST_F(SocketIndexes, The_last_slot_is_cut_off_and_comes_back_new) {
  Object->ArrayAdd(1);
  Object->ArrayAdd(2);
  Object->SetTag(2, u"tag");
  Object->ArrayRemove(2);
  Object->ArrayAdd(3);
  EXPECT_EQ(Object->RemotePort(3), 0);
  EXPECT_EQ(Object->Tag(3), u"");
}

TEST_F(SocketIndexes, When_all_slots_are_free_they_all_go) {
  for (const std::int32_t index : {1, 2, 3}) Object->ArrayAdd(index);
  for (const std::int32_t index : {1, 2, 3}) Object->ArrayRemove(index);
  for (const std::int32_t index : {4, 5, 6}) {
    Object->ArrayAdd(index);
    EXPECT_EQ(Object->RemotePort(index), 0);
  }
}

TEST_F(SocketIndexes, Any_order_of_additions_and_removals_keeps_each_index_its_own_socket) {
  std::uint32_t random = 1;
  std::vector<std::int32_t> live;
  for (std::int32_t step = 1; step <= 2000; ++step) {
    random = random * 1664525 + 1013904223;
    if (live.empty() || (random >> 16) % 5 < 3) {
      Object->ArrayAdd(step);
      Object->SetTag(step, DecimalText(step));
      live.push_back(step);
    } else {
      const auto victim = live.begin() + static_cast<std::ptrdiff_t>((random >> 8) % live.size());
      Object->ArrayRemove(*victim);
      live.erase(victim);
    }
    ASSERT_EQ(Object->ArrayCount(), static_cast<std::int32_t>(live.size()));
  }
  for (const std::int32_t index : live) ASSERT_EQ(Object->Tag(index), DecimalText(index));
}

} // namespace
} // namespace quendra::foundation

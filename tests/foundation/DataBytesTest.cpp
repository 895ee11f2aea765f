#include "foundation/DataBytes.h"
#include "foundation/ByteQueue.h"

#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra::foundation {
namespace {

TEST(DataBytes, Each_kind_has_its_size) {
  EXPECT_EQ(SizeOf(DataKind::Byte), 1u);
  EXPECT_EQ(SizeOf(DataKind::Boolean), 2u);
  EXPECT_EQ(SizeOf(DataKind::Integer), 2u);
  EXPECT_EQ(SizeOf(DataKind::Long), 4u);
  EXPECT_EQ(SizeOf(DataKind::Single), 4u);
  EXPECT_EQ(SizeOf(DataKind::Double), 8u);
  EXPECT_EQ(SizeOf(DataKind::Currency), 8u);
  EXPECT_EQ(SizeOf(DataKind::Date), 8u);
  EXPECT_EQ(SizeOf(DataKind::String), 0u);
  EXPECT_EQ(SizeOf(DataKind::ByteArray), 0u);
}

TEST(DataBytes, Any_boolean_but_0_reads_as_true_and_true_goes_out_as_minus_1) {
  EXPECT_EQ(ValueOf(DataKind::Boolean, {0, 1}), Variant(true));
  EXPECT_EQ(ValueOf(DataKind::Boolean, {0, 0}), Variant(false));
  EXPECT_EQ(BytesOf(true), (ByteArray{0xFF, 0xFF}));
  EXPECT_EQ(BytesOf(false), (ByteArray{0, 0}));
}

TEST(DataBytes, Empty_and_null_values_have_no_bytes) {
  EXPECT_FALSE(BytesOf({}));
  EXPECT_FALSE(BytesOf(Null()));
}

TEST(Values, Numbers_booleans_and_texts_of_numbers_are_numeric) {
  EXPECT_EQ(Variant(true).NumberIfAny(), -1);
  EXPECT_EQ(Variant(Variant()).NumberIfAny(), 0);
  EXPECT_EQ(Variant(Text(u" 1e2 ")).NumberIfAny(), 100);
  EXPECT_EQ(Variant(Currency{15000}).NumberIfAny(), 1.5);
  EXPECT_EQ(Variant(std::uint8_t{255}).NumberIfAny(), 255);
  EXPECT_FALSE(Variant(Text(u"1x")).NumberIfAny());
  EXPECT_FALSE(Variant(Null()).NumberIfAny());
  EXPECT_FALSE(Variant(Date{1}).NumberIfAny());
  EXPECT_FALSE(Variant(ByteArray{1}).NumberIfAny());
}

TEST(Values, A_number_is_rounded_to_32_bits_or_raises_what_is_wrong_with_it) {
  EXPECT_EQ(Variant(2.5).AsInt32(), 2);
  EXPECT_THROW(Variant(1e12).AsInt32(), Fault);
  EXPECT_THROW(Variant(Text(u"x")).AsInt32(), Fault);
}

TEST(Values, Each_value_but_bytes_and_null_has_a_text) {
  EXPECT_EQ(Variant(Text(u"a")).AsText(), u"a");
  EXPECT_EQ(Variant().AsText(), u"");
  EXPECT_EQ(Variant(true).AsText(), u"True");
  EXPECT_EQ(Variant(1.5).AsText(), u"1.5");
  EXPECT_THROW(Variant(Null()).AsText(), Fault);
  EXPECT_THROW(Variant(ByteArray()).AsText(), Fault);
}

TEST(ByteQueues, Bytes_leave_in_the_order_in_which_they_came) {
  ByteQueue queue;
  ByteArray all;
  ByteArray taken;
  for (std::size_t round = 1; round <= 300; ++round) {
    ByteArray more(round % 37);
    for (auto& byte : more) byte = static_cast<std::uint8_t>(round * 31);
    queue.Append(more);
    all.insert(all.end(), more.begin(), more.end());
    const ByteArray part = queue.Take(std::min<std::size_t>(queue.Size(), round % 23));
    taken.insert(taken.end(), part.begin(), part.end());
    ASSERT_EQ(queue.Size() + taken.size(), all.size());
  }
  const ByteArray rest = queue.Take(queue.Size());
  taken.insert(taken.end(), rest.begin(), rest.end());
  EXPECT_EQ(taken, all);
  EXPECT_TRUE(queue.IsEmpty());
}

TEST(ByteQueues, Room_that_was_not_used_goes_back) {
  ByteQueue queue;
  queue.Append(ByteArray{1, 2, 3});
  queue.DropFirst(1);
  queue.Extend(10)[0] = 4;
  queue.DropLast(9);
  EXPECT_EQ(queue.Take(queue.Size()), (ByteArray{2, 3, 4}));
  queue.Extend(5);
  queue.DropLast(5);
  EXPECT_TRUE(queue.IsEmpty());
}

} // namespace
} // namespace quendra::foundation

#include "runtime/Variant.h"

#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra {
namespace {

TEST(Variant, Starts_as_the_empty_text) {
  const Variant fresh;

  EXPECT_TRUE(fresh.IsEmpty());
  EXPECT_EQ(fresh.AsText(), u"");
}

TEST(Variant, A_number_is_never_empty) { EXPECT_FALSE(Variant(0).IsEmpty()); }

TEST(Variant, A_text_that_holds_a_number_reads_as_one) {
  EXPECT_EQ(Variant(u"1.5").Number(), 1.5);
  EXPECT_EQ(Variant(2.5).Number(), 2.5);
}

TEST(Variant, A_text_without_a_number_is_a_type_mismatch) {
  try {
    (void)Variant(u"").Number();
    FAIL() << "the empty text was read as a number";
  } catch (const Fault& fault) {
    EXPECT_EQ(fault.number, Fault::kTypeMismatch);
  }
}

TEST(Variant, A_number_reads_as_its_decimal_text) {
  EXPECT_EQ(Variant(1.46484375).AsText(), u"1.46484375");
  EXPECT_EQ(Variant(std::uint32_t{4294967295}).AsText(), u"4294967295");
}

TEST(Variant, Only_a_number_can_be_added_to_in_place) {
  Variant number(1.0);
  Variant text(u"1");

  *number.NumberInPlace() += 0.5;

  EXPECT_EQ(number.Number(), 1.5);
  EXPECT_EQ(text.NumberInPlace(), nullptr);
}

TEST(Variant, Nothing_at_all_is_not_the_empty_text) {
  EXPECT_TRUE(Variant().IsMissing());
  EXPECT_FALSE(Variant(u"").IsMissing());
  EXPECT_TRUE(Variant(u"").IsEmpty());
  EXPECT_FALSE(Variant() == Variant(u""));
  EXPECT_FALSE(Variant() == Variant(0));
}

TEST(Variant, A_value_is_of_the_kind_that_it_was_made_from) {
  const std::pair<Variant, DataKind> kinds[] = {
      {Variant(), DataKind::None},
      {Null(), DataKind::Other},
      {true, DataKind::Boolean},
      {std::uint8_t{1}, DataKind::Byte},
      {std::int16_t{1}, DataKind::Integer},
      {std::int32_t{1}, DataKind::Long},
      {1.0F, DataKind::Single},
      {1.0, DataKind::Double},
      {std::uint32_t{1}, DataKind::Double},
      {Currency{1}, DataKind::Currency},
      {Date{1}, DataKind::Date},
      {u"1", DataKind::String},
      {ByteArray{1}, DataKind::ByteArray},
  };
  for (const auto& [value, kind] : kinds) EXPECT_EQ(value.Kind(), kind);
}

TEST(Variant, Numbers_of_any_width_are_the_same_and_other_kinds_differ) {
  EXPECT_EQ(Variant(std::uint8_t{5}), Variant(5));
  EXPECT_EQ(Variant(std::int16_t{5}), Variant(5.0F));
  EXPECT_FALSE(Variant(5) == Variant(5.5));
  EXPECT_FALSE(Variant(true) == Variant(-1));
  EXPECT_FALSE(Variant(Date{1}) == Variant(1));
  EXPECT_FALSE(Variant(ByteArray{1}) == Variant(ByteArray{2}));
}

TEST(Variant, What_is_not_numeric_is_a_type_mismatch_as_a_number) {
  for (const Variant& value : {Variant(Null()), Variant(Date{1}), Variant(ByteArray{1})}) {
    EXPECT_THROW((void)value.Number(), Fault);
    EXPECT_THROW((void)value.AsInt32(), Fault);
  }
  EXPECT_EQ(Variant(true).Number(), -1);
  EXPECT_EQ(Variant(std::int16_t{-7}).Number(), -7);
}

TEST(Variant, A_number_and_its_text_are_not_the_same) {
  EXPECT_EQ(Variant(1.0), Variant(1));
  EXPECT_FALSE(Variant(1.0) == Variant(u"1"));
}

} // namespace
} // namespace quendra

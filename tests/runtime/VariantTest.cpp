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

TEST(Variant, A_number_and_its_text_are_not_the_same) {
  EXPECT_EQ(Variant(1.0), Variant(1));
  EXPECT_FALSE(Variant(1.0) == Variant(u"1"));
}

} // namespace
} // namespace quendra

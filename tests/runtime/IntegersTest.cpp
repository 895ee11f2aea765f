#include "runtime/Integers.h"

#include <gtest/gtest.h>

#include <cmath>

namespace quendra {
namespace {

template <typename Work> int FaultOf(Work work) {
  try {
    work();
  } catch (const Fault& fault) {
    return fault.number;
  }
  return 0;
}

TEST(Integers, A_16_bit_field_takes_its_whole_range) {
  EXPECT_EQ(ToInt16(32767), 32767);
  EXPECT_EQ(ToInt16(-32768), -32768);
}

TEST(Integers, A_value_beside_a_16_bit_field_overflows) {
  EXPECT_EQ(FaultOf([] { ToInt16(32768); }), Fault::kOverflow);
  EXPECT_EQ(FaultOf([] { ToInt16(-32769); }), Fault::kOverflow);
}

TEST(Integers, A_value_beside_a_32_bit_field_overflows) {
  EXPECT_EQ(ToInt32(2147483647), 2147483647);
  EXPECT_EQ(FaultOf([] { ToInt32(2147483648); }), Fault::kOverflow);
  EXPECT_EQ(FaultOf([] { ToInt32(-2147483649); }), Fault::kOverflow);
}

TEST(Integers, A_field_without_a_sign_takes_no_negative_value) {
  EXPECT_EQ(CheckedTo<std::uint8_t>(255), 255);
  EXPECT_EQ(FaultOf([] { CheckedTo<std::uint8_t>(-1); }), Fault::kOverflow);
}

TEST(Integers, True_is_minus_one) {
  EXPECT_EQ(kTrue16, -1);
  EXPECT_EQ(kFalse16, 0);
}

TEST(Integers, Halves_go_to_the_even_neighbour) {
  EXPECT_EQ(RoundToInt32(0.5), 0);
  EXPECT_EQ(RoundToInt32(1.5), 2);
  EXPECT_EQ(RoundToInt32(2.5), 2);
  EXPECT_EQ(RoundToInt32(-1.5), -2);
  EXPECT_EQ(RoundToInt32(7.65), 8);
}

TEST(Integers, Rounding_overflows_outside_32_bits) {
  EXPECT_EQ(RoundToInt32(2147483647.4), 2147483647);
  EXPECT_EQ(RoundToInt32(-2147483648.5), -2147483647 - 1);
  EXPECT_EQ(FaultOf([] { RoundToInt32(2147483647.5); }), Fault::kOverflow);
  EXPECT_EQ(FaultOf([] { RoundToInt32(-2147483648.6); }), Fault::kOverflow);
  EXPECT_EQ(FaultOf([] { RoundToInt32(std::nan("")); }), Fault::kOverflow);
}

TEST(Quotient, Division_by_zero_is_fault_11) {
  EXPECT_EQ(FaultOf([] { Quotient(1, 0); }), Fault::kDivision);
}

TEST(Quotient, Zero_by_zero_is_fault_6) {
  EXPECT_EQ(FaultOf([] { Quotient(0, 0); }), Fault::kOverflow);
}

TEST(Quotient, What_no_double_holds_is_fault_6) {
  EXPECT_EQ(FaultOf([] { Quotient(1e308, 1e-3); }), Fault::kOverflow);
}

TEST(Quotient, A_negative_divisor_divides) { EXPECT_DOUBLE_EQ(Quotient(3, -2), -1.5); }

} // namespace
} // namespace quendra

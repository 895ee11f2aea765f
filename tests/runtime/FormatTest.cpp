#include "runtime/Format.h"

#include "runtime/Fault.h"

#include <gtest/gtest.h>

#include <limits>

namespace quendra {
namespace {

struct Formatted {
  double value;
  const char16_t* format;
  Text text;
};

TEST(Format, Rates_and_meters_come_out_as_the_tables_show_them) {
  const Formatted cases[] = {
      {3.5, u"###00.00", u"03.50"},    {123.4, u"###00.00", u"123.40"},
      {0.004, u"###00.00", u"00.00"},  {100000.5, u"###00.00", u"100000.50"},
      {0.0, u"###00.00", u"00.00"},    {99999.99, u"###00.00", u"99999.99"},
      {3.5, u"##000.00", u"003.50"},   {123.4, u"##000.00", u"123.40"},
      {0.004, u"##000.00", u"000.00"}, {1234567.891, u"##000.00", u"1234567.89"},
      {3.5, u"####0.00", u"3.50"},     {0.25, u"####0.00", u"0.25"},
      {12.0, u"####0.00", u"12.00"},   {100000.5, u"####0.00", u"100000.50"},
  };
  for (const Formatted& row : cases) EXPECT_EQ(Format(row.value, row.format), row.text) << row.value;
}

TEST(Format, Halves_are_rounded_away_from_zero) {
  EXPECT_EQ(Format(0.125, u"####0.00"), u"0.13");
  EXPECT_EQ(Format(0.135, u"####0.00"), u"0.14");
  EXPECT_EQ(Format(2.5, u"0"), u"3");
  EXPECT_EQ(Format(0.5, u"0"), u"1");
  EXPECT_EQ(Format(-0.125, u"####0.00"), u"-0.13");
  EXPECT_EQ(Format(-2.5, u"0"), u"-3");
}

TEST(Format, A_half_is_one_in_the_decimal_form_of_the_number) {
  // As binary fractions both lie a little below the half.
  EXPECT_EQ(Format(1.005, u"0.00"), u"1.01");
  EXPECT_EQ(Format(2.675, u"0.00"), u"2.68");
}

TEST(Format, A_carry_goes_through_all_nines) {
  EXPECT_EQ(Format(9.999, u"###00.00"), u"10.00");
  EXPECT_EQ(Format(99.995, u"###00.00"), u"100.00");
  EXPECT_EQ(Format(0.999, u"####0.00"), u"1.00");
}

TEST(Format, A_negative_value_has_its_sign_before_the_padding) {
  EXPECT_EQ(Format(-3.5, u"###00.00"), u"-03.50");
  EXPECT_EQ(Format(-123.4, u"##000.00"), u"-123.40");
}

TEST(Format, A_negative_value_that_rounds_to_zero_has_no_sign) {
  EXPECT_EQ(Format(-0.004, u"###00.00"), u"00.00");
  EXPECT_EQ(Format(-0.0, u"####0.00"), u"0.00");
}

TEST(Format, A_format_without_a_point_gives_none) {
  EXPECT_EQ(Format(3.4, u"000"), u"003");
  EXPECT_EQ(Format(0.4, u"#"), u"");
}

TEST(Format, Places_behind_the_point_that_are_free_lose_their_zeros) {
  EXPECT_EQ(Format(1.5, u"0.0##"), u"1.5");
  EXPECT_EQ(Format(1.25, u"0.0##"), u"1.25");
  EXPECT_EQ(Format(1.0, u"0.0##"), u"1.0");
}

TEST(Format, The_largest_and_smallest_doubles_come_out_without_harm) {
  EXPECT_EQ(Format(1e300, u"0").size(), 301U);
  EXPECT_EQ(Format(5e-324, u"###00.00"), u"00.00");
}

int NumberOfFault(double value) {
  try {
    Format(value, u"0.00");
  } catch (const Fault& fault) {
    return fault.number;
  }
  return 0;
}

TEST(Format, A_value_that_is_not_finite_overflows) {
  EXPECT_EQ(NumberOfFault(std::numeric_limits<double>::infinity()), Fault::kOverflow);
  EXPECT_EQ(NumberOfFault(-std::numeric_limits<double>::infinity()), Fault::kOverflow);
  EXPECT_EQ(NumberOfFault(std::numeric_limits<double>::quiet_NaN()), Fault::kOverflow);
}

TEST(NumberOf, Reads_numbers_with_blanks_signs_points_and_exponents) {
  EXPECT_EQ(NumberOf(u" 1.46484375 "), 1.46484375);
  EXPECT_EQ(NumberOf(u"-5"), -5);
  EXPECT_EQ(NumberOf(u"+5"), 5);
  EXPECT_EQ(NumberOf(u".5"), 0.5);
  EXPECT_EQ(NumberOf(u"1E3"), 1000);
}

int FaultOfText(TextView text) {
  try {
    NumberOf(text);
  } catch (const Fault& fault) {
    return fault.number;
  }
  return 0;
}

TEST(NumberOf, A_text_without_a_number_is_a_type_mismatch) {
  for (const TextView text : {u"", u" ", u"abc", u"1x", u"1 2", u"--1", u"+-1", u"\u0661", u"nan", u"inf"})
    EXPECT_EQ(FaultOfText(text), Fault::kTypeMismatch) << ToUtf8(text);
}

TEST(Format, A_comma_between_places_parts_the_digits_in_threes) {
  EXPECT_EQ(Format(1, u"###,###,###"), u"1");
  EXPECT_EQ(Format(999, u"###,###,###"), u"999");
  EXPECT_EQ(Format(1000, u"###,###,###"), u"1,000");
  EXPECT_EQ(Format(1234567, u"###,###,###"), u"1,234,567");
  EXPECT_EQ(Format(1234567890, u"###,###,###"), u"1,234,567,890");
  EXPECT_EQ(Format(-2097152, u"###,###,###"), u"-2,097,152");
  EXPECT_EQ(Format(0, u"###,###,###"), u"");
}

TEST(NumberOf, A_number_beyond_a_double_overflows) { EXPECT_EQ(FaultOfText(u"1e999"), Fault::kOverflow); }

TEST(NumberText, Has_fifteen_significant_digits_and_no_more_than_needed) {
  EXPECT_EQ(NumberText(0), u"0");
  EXPECT_EQ(NumberText(1.46484375), u"1.46484375");
  EXPECT_EQ(NumberText(0.1), u"0.1");
  EXPECT_EQ(NumberText(1.0 / 3), u"0.333333333333333");
  EXPECT_EQ(NumberText(-2), u"-2");
  EXPECT_EQ(NumberText(1e20), u"1E+20");
  EXPECT_EQ(NumberText(2.5e-7), u"2.5E-07");
}

} // namespace
} // namespace quendra

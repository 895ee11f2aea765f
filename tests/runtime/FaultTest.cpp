#include "runtime/Fault.h"

#include <gtest/gtest.h>

namespace quendra {
namespace {

TEST(Fault, Carries_the_run_times_description_of_its_number) {
  const std::pair<int, Text> descriptions[] = {
      {6, u"Overflow"},
      {7, u"Out of memory"},
      {9, u"Subscript out of range"},
      {11, u"Division by zero"},
      {13, u"Type mismatch"},
      {28, u"Out of stack space"},
      {91, u"Object variable or With block variable not set"},
      {429, u"ActiveX component can't create object"},
      {457, u"This key is already associated with an element of this collection"},
  };
  for (const auto& [number, description] : descriptions)
    EXPECT_EQ(Fault(number).description, description) << number;
}

TEST(Fault, Has_a_general_description_for_a_number_without_one) {
  EXPECT_EQ(Fault(40006).description, u"Application-defined or object-defined error");
}

TEST(Fault, A_class_gives_its_own_description_and_source) {
  const Fault fault(40006, u"Wrong protocol", u"CSocketPlus.Connect");

  EXPECT_EQ(fault.number, 40006);
  EXPECT_EQ(fault.description, u"Wrong protocol");
  EXPECT_EQ(fault.source, u"CSocketPlus.Connect");
}

TEST(Fault, Says_number_and_description_to_those_who_log_exceptions) {
  EXPECT_STREQ(Fault(6).what(), "fault 6: Overflow");
}

} // namespace
} // namespace quendra

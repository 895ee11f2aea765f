#include "forms/loop/PumpGate.h"

#include <gtest/gtest.h>

#include <functional>

namespace quendra::forms {
namespace {

struct PumpGateTest : testing::Test {
  std::int64_t now = 1;
  PumpGate<std::function<std::int64_t()>> gate{[this] { return now; }};
};

TEST_F(PumpGateTest, The_first_pump_is_due) { EXPECT_TRUE(gate.IsDue(false)); }

TEST_F(PumpGateTest, A_pump_is_due_again_when_the_clock_has_moved) {
  gate.Pumped();
  EXPECT_FALSE(gate.IsDue(false));

  now += 4;

  EXPECT_TRUE(gate.IsDue(false));
}

TEST_F(PumpGateTest, Waiting_work_is_due_at_once) {
  gate.Pumped();

  EXPECT_TRUE(gate.IsDue(true));
}

TEST_F(PumpGateTest, The_clock_is_not_read_where_work_waits) {
  int readings = 0;
  const PumpGate counting([&] { return ++readings; });

  EXPECT_TRUE(counting.IsDue(true));

  EXPECT_EQ(readings, 0);
}

} // namespace
} // namespace quendra::forms

#pragma once

#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

namespace quendra::platform::simulated {

using Lines = std::vector<std::string>;
using Bytes = std::vector<std::uint8_t>;

struct SimulatedMachineTest : testing::Test {
  SimulatedMachine machine;
  Machine operations = machine.Operations();
};

} // namespace quendra::platform::simulated

#include "platform/simulated/SimulatedMachine.h"

#include <type_traits>

namespace quendra::platform::simulated {

// Nothing refers to a machine that has moved away.
static_assert(!std::is_copy_constructible_v<SimulatedMachine> &&
              !std::is_move_constructible_v<SimulatedMachine>);

} // namespace quendra::platform::simulated

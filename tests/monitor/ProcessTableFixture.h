#pragma once

#include "monitor/MonitorFixture.h"

namespace quendra::monitor {

using Ids = std::vector<std::int64_t>;

struct ProcessTableTest : MonitorFixture {};

} // namespace quendra::monitor

#pragma once

namespace quendra::platform::linux_ {

/// True for those who may look at every process: the administrator, and who may trace any process.
bool MayTraceEveryProcess();

} // namespace quendra::platform::linux_

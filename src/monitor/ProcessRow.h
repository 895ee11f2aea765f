#pragma once

#include "forms/controls/ListView.h"

namespace quendra::monitor {

/// The cells of a row of the process table. The row's own Tag is the liveness mark: empty during a pass, "1"
/// once the pass has seen the process.
enum ProcessCell : int {
  kApplicationCell = 0,     ///< text: application name; Tag: liveness mark
  kNameCell = 1,            ///< text: executable file name; Tag: full module path, empty when unknown
  kClassCell = 2,           ///< text: "Service", "User", "System" or empty; Tag: tick count at creation
  kPortsCell = 3,           ///< text: ports as .80.1025.; Tag: tick count at creation
  kUploadCell = 4,          ///< text: rate in KB/s; Tag: running total in KB
  kDownloadCell = 5,        ///< text: rate in KB/s; Tag: running total in KB
  kTotalCell = 6,           ///< text: sum of both rates; Tag: 0
  kOverallCell = 7,         ///< hidden
  kPreviousUploadCell = 8,  ///< Tag: upload total at the previous pass
  kPreviousDownloadCell = 9 ///< Tag: download total at the previous pass
};

/// The Tag of a row that the pass under way has seen.
inline constexpr const char16_t* kAlive = u"1";

/// "p" and the decimal process id.
Text KeyOfProcess(std::uint32_t processId);
/// The key from its second character on, as a number.
std::int64_t ProcessIdOfKey(TextView key);

} // namespace quendra::monitor

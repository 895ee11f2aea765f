#include "monitor/ProcessRow.h"

#include "runtime/Format.h"

namespace quendra::monitor {

Text KeyOfProcess(std::uint32_t processId) { return u"p" + DecimalText(processId); }

std::int64_t ProcessIdOfKey(TextView key) { return static_cast<std::int64_t>(NumberOf(key.substr(1))); }

} // namespace quendra::monitor

#include "platform/linux/process/TraceRight.h"

#include <linux/capability.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace quendra::platform::linux_ {

bool MayTraceEveryProcess() {
  if (::geteuid() == 0) return true;
  __user_cap_header_struct header{_LINUX_CAPABILITY_VERSION_3, 0};
  __user_cap_data_struct data[_LINUX_CAPABILITY_U32S_3]{};
  if (::syscall(SYS_capget, &header, data) != 0) return false;
  return (data[CAP_TO_INDEX(CAP_SYS_PTRACE)].effective & CAP_TO_MASK(CAP_SYS_PTRACE)) != 0;
}

} // namespace quendra::platform::linux_

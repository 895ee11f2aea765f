#include "winapi/Winapi.h"
#include "gtest/internal/custom/gtest-port.h"

namespace testing::internal {

void AutoHandle::Reset(Handle handle) {
  if (handle_ == handle) return;
  if (handle_ != Invalid() && handle_ != nullptr) ::CloseHandle(handle_);
  handle_ = handle;
}

} // namespace testing::internal

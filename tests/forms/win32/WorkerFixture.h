#pragma once

#include "winapi/Winapi.h"

#include <functional>

namespace quendra::forms::win32 {

/// A thread of the system's that runs some work.
class Worker {
 public:
  explicit Worker(std::function<void()> work) : work_(std::move(work)) {
    thread_ = ::CreateThread(nullptr, 0, Run, this, 0, nullptr);
  }
  ~Worker() {
    ::WaitForSingleObject(thread_, INFINITE);
    ::CloseHandle(thread_);
  }
  Worker(const Worker&) = delete;
  Worker& operator=(const Worker&) = delete;

 private:
  static DWORD WINAPI Run(void* worker) {
    static_cast<Worker*>(worker)->work_();
    return 0;
  }
  std::function<void()> work_;
  HANDLE thread_;
};

} // namespace quendra::forms::win32

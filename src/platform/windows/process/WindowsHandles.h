#pragma once

#include "platform/process/Handles.h"
#include "platform/windows/process/LastError.h"
#include "platform/windows/system/LazyLibrary.h"

#include <memory>
#include <vector>

namespace quendra::platform::windows {

/// The native calls of the system, which it doesn't promise to keep: without one its status is that of a call
/// that isn't implemented.
class WindowsHandles : public Handles {
 public:
  explicit WindowsHandles(LastError& lastError);
  ~WindowsHandles() override;

  std::uint32_t NtQuerySystemInformation(std::uint32_t informationClass, std::span<std::uint8_t> buffer,
                                         std::uint32_t& returnedLength) override;
  bool DuplicateHandle(Handle sourceProcess, Handle handle, Handle targetProcess, Handle& duplicate,
                       std::uint32_t access, bool inherit, std::uint32_t options) override;
  std::uint32_t NtQueryObject(Handle handle, std::uint32_t informationClass, std::span<std::uint8_t> buffer,
                              std::uint32_t& returnedLength) override;
  Handle CreateEventW(bool manualReset, bool initialState, const std::u16string& name) override;
  std::uint32_t NtDeviceIoControlFile(Handle handle, Handle event, std::uint32_t controlCode,
                                      std::span<const std::uint8_t> input,
                                      std::span<std::uint8_t> output) override;

 private:
  struct Request;

  void DropAnswered();

  LastError& lastError_;
  LazyLibrary ntdll_{L"ntdll.dll"};
  /// Those that the system has not answered: it may still write to them.
  std::vector<std::unique_ptr<Request>> waiting_;
};

} // namespace quendra::platform::windows

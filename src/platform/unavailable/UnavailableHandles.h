#pragma once

#include "platform/process/Handles.h"

#include <array>

namespace quendra::platform::unavailable {

/// A system without a list of all handles: every call fails as an operation that doesn't exist.
class UnavailableHandles : public Handles {
 public:
  std::uint32_t NtQuerySystemInformation(std::uint32_t, std::span<std::uint8_t>,
                                         std::uint32_t& returned) override {
    returned = 0;
    return kStatusNotImplemented;
  }
  bool DuplicateHandle(Handle, Handle, Handle, Handle&, std::uint32_t, bool, std::uint32_t) override {
    return false;
  }
  std::uint32_t NtQueryObject(Handle, std::uint32_t, std::span<std::uint8_t>,
                              std::uint32_t& returned) override {
    returned = 0;
    return kStatusNotImplemented;
  }
  Handle CreateEventW(bool, bool, const std::u16string&) override { return kNoHandle; }
  std::uint32_t NtDeviceIoControlFile(Handle, Handle, std::uint32_t, std::span<const std::uint8_t>,
                                      std::span<std::uint8_t>) override {
    return kStatusNotImplemented;
  }
};

} // namespace quendra::platform::unavailable

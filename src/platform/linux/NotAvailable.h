#pragma once

#include "platform/Handles.h"
#include "platform/Sockets.h"

namespace quendra::platform::linux_ {

/// This system has no list of all handles: every call fails as an operation that doesn't exist.
class LinuxHandles : public Handles {
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

/// Nothing asks for sockets on this system so far: every call fails.
class LinuxSockets : public Sockets {
 public:
  std::int32_t recv(SocketHandle, std::span<std::uint8_t>, std::int32_t) override { return -1; }
  std::int32_t WSAAsyncSelect(SocketHandle, std::uint32_t, std::uint32_t, std::int32_t) override {
    return -1;
  }
  std::int32_t closesocket(SocketHandle) override { return -1; }
  bool WSAIsBlocking() override { return false; }
  std::int32_t WSACancelBlockingCall() override { return -1; }
  std::int32_t WSACleanup() override { return -1; }
};

} // namespace quendra::platform::linux_

#pragma once

#include "platform/net/HostNames.h"
#include "platform/windows/net/SocketLibrary.h"

namespace quendra::platform::windows {

/// The own name and the addresses of names as the socket library knows them, which it opens for itself. The
/// own name stands for the addresses that the system gives this machine, that of a line that was dialled
/// among them.
class WindowsHostNames : public HostNames {
 public:
  explicit WindowsHostNames(const SocketLibrary& library) : library_(library) {}
  ~WindowsHostNames() override;

  std::optional<std::string> gethostname() override;
  std::optional<std::vector<Ipv4Address>> gethostbyname(const std::string& name) override;
  std::int32_t LastError() override { return lastError_; }

 private:
  /// False, with the error set, when the library can't be opened.
  bool Start();

  const SocketLibrary& library_;
  bool started_ = false;
  std::int32_t lastError_ = 0;
};

} // namespace quendra::platform::windows

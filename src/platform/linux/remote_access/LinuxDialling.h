#pragma once

#include "platform/linux/remote_access/ActiveLines.h"
#include "platform/linux/remote_access/Dial.h"
#include "platform/remote_access/Dialling.h"

#include <map>
#include <memory>
#include <set>

namespace quendra::platform::linux_ {

/// Dials by NetworkManager. Without it there is no remote access.
class LinuxDialling : public Dialling {
 public:
  /// The folder is there where the kernel speaks PPP.
  LinuxDialling(ConnectionBook& book, NetworkManagerBus& bus, EventLoop& loop,
                std::string kernelFolder = "/sys/class/ppp");

  std::uint32_t RasDialA(std::span<const std::uint8_t> extensions, const char* phoneBook,
                         std::span<const std::uint8_t> params, const Notifier& notifier,
                         RasConnection& connection) override;
  std::uint32_t RasHangUpA(RasConnection connection) override;
  std::uint32_t RasEnumConnectionsA(std::span<std::uint8_t> connections, std::uint32_t& bytes,
                                    std::uint32_t& count) override;
  /// Needs no NetworkManager: that there is none is told, too.
  std::uint32_t RasGetErrorStringA(std::uint32_t error, std::span<char> text) override;

 private:
  /// What has a handle.
  struct Call {
    RasConnection handle;
    Line line;
    std::shared_ptr<Dial> dial{}; ///< nothing for one of another program's
    std::string activePath{};     ///< of that

    bool HasEnded() const { return dial && dial->CurrentStage() == Dial::Stage::Ended; }
    bool Makes(const ActiveLine& active) const;
  };

  void Hear(const BusSignal& signal);
  Dial::Change TellerOf(const Notifier& notifier);
  std::uint32_t WaitForEnd(const std::shared_ptr<Dial>& dial);
  Call& Add(const Line& line);
  std::uint32_t AddActive();
  void Forget(RasConnection handle);

  ConnectionBook& book_;
  NetworkManagerBus& bus_;
  EventLoop& loop_;
  const std::string kernelFolder_;
  std::vector<Call> calls_;
  std::set<RasConnection> hungUp_; ///< by this program
  std::uint32_t lastHandle_ = 0;
};

} // namespace quendra::platform::linux_

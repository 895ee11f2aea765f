#pragma once

#include "platform/linux/network_manager/NetworkManagerBus.h"
#include "platform/linux/remote_access/DialTable.h"
#include "platform/linux/remote_access/LineSettings.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// One dial, from the question to NetworkManager to the end of the connection.
class Dial : public std::enable_shared_from_this<Dial> {
 public:
  /// A state or a failure of the dial.
  using Change = std::function<void(std::uint32_t state, std::uint32_t error)>;
  enum class Stage { Dialling, Connected, Ended };

  /// The kernel is asked for PPP when a reason leaves it open.
  Dial(NetworkManagerBus& bus, LineKind kind, std::function<KernelPpp()> kernel, Change change);

  /// Asks NetworkManager for the connection at that path.
  void Start(const std::string& connectionPath);
  void Take(const BusSignal& signal);
  /// The connection ends, if need be as soon as it is known, and nothing is told from now on. So does one
  /// that was lost sight of. The error number: with one, nothing has changed.
  std::uint32_t HangUp();

  Stage CurrentStage() const { return stage_; }
  /// Of the end.
  std::uint32_t Error() const { return error_; }
  /// The object of NetworkManager's; empty while it isn't known.
  const std::string& ActivePath() const { return activePath_; }
  /// Finds out whether NetworkManager is still at it, for one who waits for nothing else.
  void CheckAlive();

 private:
  void TakeActive(const BusAnswer& answer);
  void TakeProperties(const BusAnswer& answer);
  void TakeFromDevice(std::uint64_t state, std::uint64_t reason);
  void TakeFromVpn(std::uint64_t state, std::uint64_t reason);
  void TakeFromActive(std::uint64_t state, std::uint64_t reason);
  void Reach(std::uint32_t state);
  void End(std::uint32_t error);
  bool MayStandUnseen();
  void AskLater(const BusQuestion& question, void (Dial::*take)(const BusAnswer&));

  NetworkManagerBus& bus_;
  const LineKind kind_;
  const std::function<KernelPpp()> kernel_;
  const Change change_;
  Stage stage_ = Stage::Dialling;
  bool isHungUp_ = false;
  bool isKnown_ = false; ///< which device it uses
  std::uint32_t state_ = 0;
  std::uint32_t error_ = 0;
  std::optional<std::uint64_t> deviceReason_; ///< of what ends it
  std::string manager_;                       ///< the one that was asked for it
  std::string activePath_;
  std::string devicePath_;
  std::vector<BusSignal> early_; ///< what came before it was known whom it concerns
};

} // namespace quendra::platform::linux_

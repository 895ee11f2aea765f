#pragma once

#include "provisioning/troubleshooter/ConnectionDiagnosis.h"

#include <deque>

namespace quendra::provisioning {

/// Dials the picked entry, shows how that goes, and hands a failure to the diagnosis.
class Troubleshooter {
 public:
  Troubleshooter(frmConnectProb& form, mdlDun& dun, ConnectionDiagnosis& diagnosis);
  Troubleshooter(const Troubleshooter&) = delete;

  void cmdCheck_Click();
  /// One change of a dial. One that comes while a diagnosis stands in a box waits for its end.
  void OnDialEvent(std::uint32_t state, std::uint32_t error);

 private:
  struct DialEvent {
    std::uint32_t state;
    std::uint32_t error;
  };
  /// More than a dial ever tells; what comes beyond is lost.
  static constexpr std::size_t kMostWaiting = 256;

  void Dial();
  void Diagnose(std::int32_t error);
  void ShowWaiting();
  void Show(DialEvent event);

  frmConnectProb& form_;
  mdlDun& dun_;
  ConnectionDiagnosis& diagnosis_;
  bool diagnosing_ = false;
  std::deque<DialEvent> waiting_;
};

} // namespace quendra::provisioning

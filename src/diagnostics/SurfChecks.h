#pragma once

#include "diagnostics/CheckRows.h"
#include "diagnostics/LocalChecks.h"
#include "diagnostics/SurfPage.h"
#include "foundation/CSocketPlus.h"
#include "runtime/Integers.h"

#include <memory>

namespace quendra::diagnostics {

/// The checks of the surf page, one after another: they begin when the page opens. Network checks go on from
/// the events of their sockets, whose indexes are the numbers of the steps; local ones run to their end in
/// one call, in which no message is handled. Sockets of finished steps stay open until the page is left.
class SurfChecks {
 public:
  SurfChecks(foundation::modSocketPlus& module, forms::FormHost& screen, SurfPage& page, LocalChecks& local);

  void surf_StartChecks();
  void surf_StopChecks();

  /// nullptr while the page isn't open.
  foundation::CSocketPlus* Sockets() { return surf_spSockets_.get(); }
  std::int16_t Step() const { return surfCheckStep_; }
  /// Kept and never shown.
  std::int16_t FailCount() const { return surfFailCount_; }

 private:
  using Index = const Variant&;

  void PrepareSockets();
  void ReleaseSockets();

  /// One step after another, up to one that waits for the network or the end of the list.
  void surf_RunCheck(std::int16_t& step);
  void BeginStep(std::int16_t step);
  void ShowRule(std::int16_t step);
  void RunLocal(std::int16_t& step);
  void ShowEnd();
  void CountFailure();

  void surf_spSockets_Connect(Index index);
  void surf_spSockets_DataArrival(Index index);
  void surf_spSockets_CloseSck(Index index);
  /// Of whichever socket: what fails is the step that is under way.
  void surf_spSockets_Error(std::int16_t number, const Text& description);
  void surf_lblBack_Click();

  foundation::modSocketPlus& module_;
  forms::FormHost& screen_;
  SurfPage& page_;
  LocalChecks& local_;
  CheckRows rows_;
  std::shared_ptr<foundation::CSocketPlus> surf_spSockets_;
  std::int16_t surfCheckStep_ = 0;
  std::int16_t surfFailCount_ = 0;
  Boolean16 surfRunning_ = kFalse16; ///< set at each step; nothing reads it
};

} // namespace quendra::diagnostics

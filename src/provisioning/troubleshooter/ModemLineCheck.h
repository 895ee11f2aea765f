#pragma once

#include "diagnostics/mdlPing.h"
#include "provisioning/VpnAdapter.h"
#include "provisioning/troubleshooter/frmConnectProb.h"

namespace quendra::provisioning {

/// Whether a modem answers at one of the addresses that modems usually have.
class ModemLineCheck {
 public:
  ModemLineCheck(frmConnectProb& form, VpnAdapter& vpnAdapter, diagnostics::mdlPing& mdlPing)
      : form_(form), vpnAdapter_(vpnAdapter), mdlPing_(mdlPing) {}

  /// Asks the modem of an entry with this device. Nobody is asked, and nobody answers, where the device's
  /// name is neither of the two names that are known. Lines in the form's log tell of each address.
  bool ModemAnswers(const Text& deviceName);

 private:
  bool PingRound();
  bool Answers(const Text& address);

  frmConnectProb& form_;
  VpnAdapter& vpnAdapter_;
  diagnostics::mdlPing& mdlPing_;
};

} // namespace quendra::provisioning

#pragma once

#include "provisioning/OwnPhoneBook.h"
#include "provisioning/troubleshooter/ModemLineCheck.h"

namespace quendra::provisioning {

/// What a dial that failed says of the line, the modem or the user name.
class ConnectionDiagnosis {
 public:
  ConnectionDiagnosis(frmConnectProb& form, mdlDun& dun, ModemLineCheck& modemLineCheck,
                      forms::MessageLoop& boxes)
      : form_(form), dun_(dun), phoneBook_(dun), modemLineCheck_(modemLineCheck), boxes_(boxes) {}

  /// Treats an error number by the entry under check, and tells of it in the form.
  void DiagnoseConnectionError(std::int32_t error);

  /// The name of the entry under check.
  Text CurrentDialEntry;

 private:
  // The treatments.

  /// The test entry fails as well: the provider can't be reached. The button stays disabled.
  void ExchangeUnreachable(std::int32_t error);
  void CheckModemLine(std::int32_t error);
  void ReferToSupport(std::int32_t error);
  /// Dials a copy of the entry with a user name that the provider's server always lets in. Gives the entry
  /// that was under check, empty where no copy could be made.
  Text TestLogin();
  void Finish(const Text& entryBefore = {});

  bool IsTestEntry() const;

  frmConnectProb& form_;
  mdlDun& dun_;
  OwnPhoneBook phoneBook_;
  ModemLineCheck& modemLineCheck_;
  forms::MessageLoop& boxes_;
};

} // namespace quendra::provisioning

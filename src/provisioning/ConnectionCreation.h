#pragma once

#include "provisioning/ConnectionStep.h"
#include "provisioning/OwnPhoneBook.h"
#include "provisioning/VpnAdapter.h"

namespace quendra::provisioning {

struct Modem;

/// Makes the entry of the phone book by which the subscriber connects, of a user name, a password and a
/// modem.
class ConnectionCreation {
 public:
  ConnectionCreation(mdlDun& dun, VpnAdapter& vpnAdapter, forms::MessageLoop& boxes,
                     const ConnectionStep& page)
      : dun_(dun), phoneBook_(dun), vpnAdapter_(vpnAdapter), boxes_(boxes), page_(page) {}

  /// Leads on to the mail step, or tells that it failed. The page's button is disabled until the end.
  void CreateConnection();

 private:
  void MendTexts();
  void AskOsVersion();
  bool WriteEntry();
  void Describe(const Modem& modem, RasEntryRecord& record, RasDialParamsRecord& dialParams);
  bool WriteByWayOfAnother(const RasEntryRecord& record, RasDialParamsRecord& dialParams);
  void GoOnToMail();

  mdlDun& dun_;
  OwnPhoneBook phoneBook_;
  VpnAdapter& vpnAdapter_;
  forms::MessageLoop& boxes_;
  const ConnectionStep page_;
};

} // namespace quendra::provisioning

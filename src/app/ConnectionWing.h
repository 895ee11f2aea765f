#pragma once

#include "mail/ExpressAccount.h"
#include "mail/MailClients.h"
#include "mail/OutlookProfile.h"
#include "mail/mdlEmail.h"
#include "platform/Machine.h"
#include "provisioning/ConnectionCreation.h"
#include "provisioning/FirstConnectionPage.h"
#include "provisioning/troubleshooter/Troubleshooter.h"

namespace quendra::app {

/// The one object of each module and dialog that works for the page for the first connection.
class ConnectionWing {
 public:
  ConnectionWing(const platform::Machine& machine, forms::Desktop& desktop,
                 provisioning::FirstConnectionPage& page);
  ConnectionWing(const ConnectionWing&) = delete;

  // What only asks the machine.
  provisioning::mdlDun mdlDun;
  diagnostics::mdlPing mdlPing;
  mail::MailClients mailClients;

  // Forms.
  provisioning::frmNetworkAdapters frmNetworkAdapters;
  provisioning::frmConnectProb frmConnectProb;

  // Modules.
  provisioning::VpnAdapter vpnAdapter;
  provisioning::ConnectionCreation connectionCreation;
  provisioning::ModemLineCheck modemLineCheck;
  provisioning::ConnectionDiagnosis connectionDiagnosis;
  provisioning::Troubleshooter troubleshooter;
  mail::ExpressAccount expressAccount;
  mail::OutlookProfile outlookProfile;
  mail::mdlEmail mdlEmail;
};

} // namespace quendra::app

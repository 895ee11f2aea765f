#include "app/ConnectionWing.h"

namespace quendra::app {

namespace {

provisioning::ConnectionStep StepOf(provisioning::FirstConnectionPage& page) {
  return {page.SelectedModem,
          page.frsCon_txtUsername,
          page.frsCon_txtPassword,
          page.frsCon_cmdCreate,
          {&page.frsCon_lblError[0], &page.frsCon_lblError[1]},
          page.frsCon_Frame1,
          page.frsCon_Frame2,
          page.frsCon_txtEmailUN};
}

mail::MailForm MailFormOf(provisioning::FirstConnectionPage& page) {
  return {page.SelectedMail, page.frsCon_txtEmailUN, page.frsCon_txtFullName, page.frsCon_txtUsername};
}

} // namespace

ConnectionWing::ConnectionWing(const platform::Machine& machine, forms::Desktop& desktop,
                               provisioning::FirstConnectionPage& page)
    : mdlDun({machine.phoneBook, machine.dialling}, machine.system, desktop), mdlPing(machine.icmp),
      mailClients(machine.installedProducts),

      frmNetworkAdapters(desktop), frmConnectProb(desktop, mdlDun),

      vpnAdapter(machine.adapters, desktop, frmNetworkAdapters),
      connectionCreation(mdlDun, vpnAdapter, desktop, StepOf(page)),
      modemLineCheck(frmConnectProb, vpnAdapter, mdlPing),
      connectionDiagnosis(frmConnectProb, mdlDun, modemLineCheck, desktop),
      troubleshooter(frmConnectProb, mdlDun, connectionDiagnosis), expressAccount(machine.registry),
      outlookProfile(machine.files, machine.shellStart, machine.processes),
      mdlEmail(MailFormOf(page), desktop, expressAccount, outlookProfile) {
  page.CreateConnection = [this] { connectionCreation.CreateConnection(); };
  page.CreateMailAccount = [this] { mdlEmail.CreateMailAccount(); };
}

} // namespace quendra::app

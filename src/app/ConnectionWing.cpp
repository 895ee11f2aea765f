#include "app/ConnectionWing.h"

namespace quendra::app {

namespace {

provisioning::ConnectionStep StepOf(provisioning::FirstConnectionPage& page) {
  provisioning::ConnectionPanel& panel = page.connection;
  return {page.SelectedModem,
          panel.frsCon_txtUsername,
          panel.frsCon_txtPassword,
          panel.frsCon_cmdCreate,
          {&page.frsCon_lblError[0], &page.frsCon_lblError[1]},
          panel.frsCon_Frame1,
          page.mail.frsCon_Frame2,
          page.mail.frsCon_txtEmailUN};
}

mail::MailForm MailFormOf(provisioning::FirstConnectionPage& page) {
  return {page.SelectedMail, page.mail.frsCon_txtEmailUN, page.mail.frsCon_txtFullName,
          page.connection.frsCon_txtUsername};
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
  page.DetectMailClients = [this] { return mailClients.DetectMailClients(); };
  page.CreateConnection = [this] { connectionCreation.CreateConnection(); };
  page.CreateMailAccount = [this] { mdlEmail.CreateMailAccount(); };
}

} // namespace quendra::app

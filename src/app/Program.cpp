#include "app/Program.h"

namespace quendra::app {

using shell::kPageTable;

Program::Program(const platform::Machine& machine, forms::Desktop& desktop)
    : desktop_(desktop), systemVersion(machine.system, desktop),
      hostAddresses(machine.hostNames, machine.ipHelper),

      frmAbout(desktop), frmMemInfo(desktop, machine.system),
      frmMenu(desktop, frmAbout, systemVersion, hostAddresses), frmSplash(desktop, frmMenu),

      monitorPage(frmMenu, kPageTable[shell::kMonitorPage]), surfPage(frmMenu, kPageTable[shell::kSurfPage]),
      firstConnectionPage(frmMenu, kPageTable[shell::kFirstConnectionPage], machine.keyboardLayout),

      mdlFileInfo(machine.processes, machine.tokens, machine.versionInfo, desktop),
      modProcPort(machine.ipHelper, {machine.processes, machine.handles}, desktop,
                  monitorPage.table.main_ListView1, mdlFileInfo),
      processRowAdder(machine.icons, machine.system, desktop, monitorPage.table, mdlFileInfo),
      portSource(systemVersion, mdlFileInfo, modProcPort),
      processTable(machine.processes, machine.system, monitorPage.table, processRowAdder, portSource),

      ownAddresses(hostAddresses), packetControl(machine.captureControls),
      packetAttribution(machine.captureLibrary, desktop, packetControl, ownAddresses, processTable),
      captureSession(machine.captureLibrary, machine.system, monitorPage.adapters, packetControl,
                     ownAddresses),
      sniffer(machine.sockets, monitorPage.table.main_ListView1, monitorPage.main_Timer1, ownAddresses),

      modSocketPlus(machine.sockets, machine.hostNames, desktop),
      supportExchange(modSocketPlus, desktop, monitorPage.reporting, processTable, monitorPage.main_Timer1),

      surf(machine, desktop, modSocketPlus, surfPage), connection(machine, desktop, firstConnectionPage),
      frmPortsChecks(desktop, modSocketPlus),

      captureSetup(machine.shellStart, frmSplash, frmMenu, captureSession, packetControl),
      monitorWork(monitorPage, processTable, supportExchange, ownAddresses, captureSession),
      processActions(monitorPage, portSource, machine.processes, machine.shellStart, desktop),
      pageDialogs(desktop, frmMenu) {
  frmMenu.Add(monitorPage);
  frmMenu.Add(surfPage);
  frmMenu.Add(firstConnectionPage);
  OfferDialogs();
  monitorWork.TearDownSniffer = [this] { sniffer.Teardown(); };
  surfPage.surf_Timer1.Tick = [this] { modProcPort.surf_Timer1_Timer(); };
}

void Program::OfferDialogs() {
  pageDialogs.Offer(monitorPage.main_cmdChecks, frmPortsChecks);
  pageDialogs.Offer(monitorPage.main_cmdMemInfo, frmMemInfo);
  pageDialogs.Offer(firstConnectionPage.menu.frsCon_lblConnectProb, connection.frmConnectProb);
}

void Program::Start() { desktop_.Show(frmSplash); }

} // namespace quendra::app

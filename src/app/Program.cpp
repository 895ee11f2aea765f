#include "app/Program.h"

namespace quendra::app {

Program::Program(const platform::Machine& machine, forms::Desktop& desktop)
    : desktop_(desktop), frmSplash(desktop, frmMenu), frmAbout(desktop),
      frmMenu(machine, desktop, frmSplash, frmAbout,
              {monitorPageSwitch, processTable, modProcPort, captureSession, supportExchange, hostAddresses,
               monitorFields}),
      mdlFileInfo(machine, desktop), modProcPort(machine, desktop, frmMenu.main_ListView1, mdlFileInfo),
      processTable(machine, desktop, frmMenu.Page(), monitorFields, mdlFileInfo, modProcPort),
      hostAddresses(machine),
      packetAttribution(machine, desktop, frmMenu.Page(), monitorFields, captureFields, processTable),
      captureSession(machine, desktop, frmMenu.Page(), captureFields, packetAttribution),
      modSocketPlus(machine.sockets, machine.hostNames, desktop),
      supportExchange(modSocketPlus, desktop, frmMenu.main_ListView1, frmMenu.main_cmdRpt, processTable,
                      frmMenu.main_Timer1),
      monitorPageSwitch(machine, monitorFields, processTable, supportExchange, captureSession) {
  captureSession.UnloadMainWindow = [this] { desktop_.Unload(frmMenu); };
}

void Program::Start() { desktop_.Show(frmSplash); }

} // namespace quendra::app

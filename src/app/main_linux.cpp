#include "app/Program.h"
#include "forms/qt/QtDesktop.h"
#include "platform/linux/LinuxMachine.h"

int main(int argc, char** argv) {
  quendra::forms::qt::QtDesktop desktop(argc, argv);
  quendra::platform::linux_::LinuxMachine machine(desktop);
  quendra::app::Program program(machine.Operations(), desktop);
  program.Start();
  return desktop.Run();
}

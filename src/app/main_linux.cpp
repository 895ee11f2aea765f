#include "app/Program.h"
#include "forms/qt/QtDesktop.h"
#include "platform/linux/LinuxMachine.h"

int main(int argc, char** argv) {
  quendra::forms::QtDesktop desktop(argc, argv);
  quendra::platform::linux_::LinuxMachine machine(desktop);
  quendra::app::Program program(machine.Operations(), desktop);
  return desktop.Run([&] { program.Start(); });
}

#include "app/Program.h"
#include "app/RegistryNotice.h"
#include "forms/qt/QtDesktop.h"
#include "platform/linux/LinuxMachine.h"

int main(int argc, char** argv) {
  quendra::forms::qt::QtDesktop desktop(argc > 0 ? argv[0] : "quendra");
  quendra::platform::linux_::LinuxMachine machine(desktop, desktop,
                                                  quendra::app::RegistryNotice(desktop, desktop));
  quendra::app::Program program(machine.Operations(), desktop);
  return desktop.Run([&] { program.Start(); });
}

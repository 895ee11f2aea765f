#include "app/Program.h"
#include "forms/qt/QtDesktop.h"
#include "platform/ReplacedFamilies.h"
#include "platform/linux/LinuxMachine.h"
#include "platform/simulated/mail/SimulatedInstalledProducts.h"

/// The program on a machine on which mail programs are installed, as none is on a Linux machine: three of one
/// maker, so that a walk through the mail page finds a tile for each.
int main(int argc, char** argv) {
  quendra::forms::qt::QtDesktop desktop(argc > 0 ? argv[0] : "quendra");
  quendra::platform::linux_::LinuxMachine machine(desktop, desktop);
  quendra::platform::simulated::SimulatedInstalledProducts products;
  products.Codes = {"{90110409-6000-11D3-8CFE-0050048383C9}", "{00160409-78E1-11D2-B60F-006097C998E7}",
                    "{90110409-6000-11D3-8CFE-0150048383C9}"};
  quendra::app::Program program(
      quendra::platform::WithReplaced(machine.Operations(), {.installedProducts = &products}), desktop);
  return desktop.Run([&] { program.Start(); });
}

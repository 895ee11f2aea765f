// The whole program on the simulated machine and the headless desktop: prints the splash as text. It links
// when no portable layer needs anything of a backend of one system.

#include "app/Program.h"
#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"

#include <cstdio>

int main() {
  using namespace quendra;
  platform::simulated::SimulatedMachine machine;
  forms::headless::HeadlessDesktop desktop;
  app::Program program(machine.Operations(), desktop);
  program.Start();
  std::puts(desktop.Render(program.frmSplash).c_str());
}

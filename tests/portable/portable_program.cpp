// The whole program on the simulated machine and the headless desktop: prints the splash as text, and what
// the capture that backends share delivers of a packet on a line made up here. It links when no portable
// layer needs anything of a backend of one system.

#include "app/Program.h"
#include "forms/headless/HeadlessDesktop.h"
#include "platform/capture/LiveCapture.h"
#include "platform/capture/ScriptedLines.h"
#include "platform/simulated/SimulatedMachine.h"

#include <cstdio>

namespace {

using namespace quendra;

std::int32_t BytesCaptured(platform::EventLoop& loop) {
  platform::ScriptedLines lines(loop, platform::Pace::Timer);
  lines.Add("line", "10.9.0.1");
  platform::LiveCapture capture(loop, lines.MakeAdapters());
  capture.VBPcapInit();
  capture.vpSetCurrentAdapter(0);
  capture.vpBegin(1000);
  lines.Arrive("line", {integration::TcpFrame(1025, 80, 60)});
  platform::FrameBytes frame;
  platform::CaptureHeader header{};
  return capture.vpCapture(frame, header);
}

} // namespace

int main() {
  platform::simulated::SimulatedMachine machine;
  forms::headless::HeadlessDesktop desktop;
  app::Program program(machine.Operations(), desktop);
  program.Start();
  std::puts(desktop.Render(program.frmSplash).c_str());
  std::printf("%d bytes captured\n", static_cast<int>(BytesCaptured(desktop)));
}

#include "app/Program.h"
#include "forms/qt/QtFixture.h"
#include "integration/Steady.h"
#include "platform/simulated/SimulatedMachine.h"

#include <QTimer>

namespace quendra::forms::qt {
namespace {

constexpr int kOrdinaryRun = 200;
/// The memory panel's timer ticks a few times meanwhile.
constexpr int kStandsMilliseconds = 35;

/// The whole program on the toolkit's desktop, over a simulated machine.
class DialogSoak : public QtFixture {
 protected:
  void SetUp() override {
    machine.AddCaptureAdapter({"lo", "Loopback", "127.0.0.1"});
    program.Start();
    Click(WidgetOf(program.frmSplash.Label2));
    ASSERT_TRUE(RunUntil([&] { return program.frmMenu.Visible(); }));
    Click(WidgetOf(program.frmMenu.lblCaption[0]));
    ASSERT_TRUE(RunUntil([&] { return program.monitorPage.frameMain.Visible(); }));
  }

  /// Clicks what shows a modal dialog, and closes it once it has stood for a while.
  void OpenAndClose(Control& button, const Form& dialog, Control& close) {
    bool closed = false;
    QObject answers; // a click that shows nothing leaves nothing behind
    QTimer::singleShot(kStandsMilliseconds, &answers, [&] {
      closed = dialog.Visible();
      if (closed) Click(WidgetOf(close));
    });
    Click(WidgetOf(button));
    ASSERT_TRUE(closed) << ToUtf8(button.Name());
    ASSERT_FALSE(dialog.IsLoaded());
  }
  void OpenAndCloseAbout() {
    Click(WidgetOf(program.frmMenu.Label1));
    ASSERT_TRUE(program.frmAbout.Visible());
    QCoreApplication::processEvents();
    Click(WidgetOf(program.frmAbout.Image1));
    ASSERT_FALSE(program.frmAbout.IsLoaded());
    QCoreApplication::processEvents();
  }
  /// A widget that goes is deleted by the loop that runs outside of its own events.
  static void DropWidgets() {
    // An end that is asked for would close the windows first.
    QTimer::singleShot(0, qApp, [] { QCoreApplication::exit(); });
    QCoreApplication::exec();
  }

  platform::simulated::SimulatedMachine machine{desktop};
  app::Program program{machine.Operations(), desktop};
  const int times = integration::TimesAskedFor("QUENDRA_SOAK_VISITS", kOrdinaryRun);
};

TEST_F(DialogSoak, Openings_of_each_dialog_leave_memory_and_descriptors_as_they_were) {
  integration::ExpectSteady("openings of three dialogs", times, [this](int) {
    OpenAndClose(program.monitorPage.main_cmdMemInfo, program.frmMemInfo, program.frmMemInfo.cmdClose);
    OpenAndClose(program.monitorPage.main_cmdChecks, program.frmPortsChecks, program.frmPortsChecks.Command2);
    OpenAndCloseAbout();
    DropWidgets();
    machine.Calls.clear();
  });
}

} // namespace
} // namespace quendra::forms::qt

#include "app/Program.h"
#include "forms/qt/QtDesktop.h"
#include "integration/RouterChain.h"
#include "integration/ScratchHome.h"
#include "integration/SocketHelpers.h"
#include "platform/linux/LinuxMachine.h"

#include <gtest/gtest.h>

#include <QAbstractButton>
#include <QMessageBox>
#include <QTimer>

namespace quendra::integration {

namespace {

/// The whole program on the desktop of Linux, in the middle of a trace over a link so slow that messages are
/// handled after each echo.
class TraceLeft : public testing::Test {
 protected:
  void SetUp() override {
    if (!NetworkNamespace::Possible()) GTEST_SKIP() << NetworkNamespace::kSkipReason;
    chain = std::make_unique<RouterChain>(3, [](const Bytes&) { return SlowLink::Passing{100}; });
    ListenSilently();
    qputenv("QT_QPA_PLATFORM", "offscreen");
    desktop = std::make_unique<forms::qt::QtDesktop>("integration_test");
    machine = std::make_unique<platform::linux_::LinuxMachine>(*desktop, *desktop);
    program = std::make_unique<app::Program>(machine->Operations(), *desktop);
  }
  void TearDown() override {
    program.reset();
    machine.reset();
    desktop.reset();
    chain.reset();
    if (web_ >= 0) close(web_);
  }

  /// Starts a trace, in which the user does something as soon as the first echo has come back. Gives the
  /// program's status; one that didn't end by itself ends with kStillThere once the trace has returned.
  int RunTraceWhile(const std::function<void()>& userActs) {
    return desktop->Run([&] {
      program->Start();
      program->frmSplash.Label2.Click();
      program->frmMenu.lblCaption[1].Click();
      program->surfPage.frmSurf_cmdAdvanced.Click();
      Panel().frmSurf_txtping.Value = FromUtf8(chain->TargetAddress());
      QTimer::singleShot(0, qApp, [&] {
        reportSeen = Report();
        userActs();
      });
      Panel().frmSurf_cmdStart.Click();
      hasReturned = true;
      desktop->End(kStillThere);
    });
  }
  /// Presses the first button of the box that will stand.
  void AnswerBox() {
    auto* timer = new QTimer(&answers_);
    QObject::connect(timer, &QTimer::timeout, &answers_, [this, timer] {
      auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
      if (!box) return;
      ++boxes;
      timer->deleteLater();
      box->buttons().constFirst()->click();
    });
    timer->start(10);
  }

  diagnostics::AdvancedPanel& Panel() { return program->surfPage.advanced; }
  std::string Report() { return ToUtf8(Panel().frmSurf_txtPingResult.Value()); }

  static constexpr int kStillThere = 7;
  std::unique_ptr<RouterChain> chain;
  std::unique_ptr<forms::qt::QtDesktop> desktop;
  std::unique_ptr<platform::linux_::LinuxMachine> machine;
  std::unique_ptr<app::Program> program;
  std::string reportSeen;
  bool hasReturned = false;
  int boxes = 0;

 private:
  /// A web server that says nothing holds the page's first check.
  void ListenSilently() {
    web_ = Check(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0), "socket");
    const sockaddr_in place = InetAddress("127.0.0.1", 80);
    Check(bind(web_, Generic(place), sizeof place), "bind");
    Check(listen(web_, 8), "listen");
  }
  QObject answers_; ///< what waits for a box goes with the test
  int web_ = -1;
  ScratchHome home_;
};

} // namespace

TEST_F(TraceLeft, By_the_back_link_and_another_page_goes_on_hidden_to_its_end_and_asks) {
  AnswerBox();

  const int status = RunTraceWhile([&] {
    program->surfPage.surf_lblBack.Click();
    program->surfPage.surf_lblBack.Click();
    program->frmMenu.lblCaption[2].Click();
  });

  EXPECT_EQ(status, kStillThere);
  EXPECT_LT(reportSeen.size(), Report().size());
  EXPECT_TRUE(Report().ends_with("\r\n\r\nTrace Route Complete")) << Report();
  EXPECT_EQ(boxes, 1);
  EXPECT_EQ(program->surf.surfChecks.Sockets(), nullptr);
  EXPECT_EQ(Panel().frmSurf_cmdStart.Caption(), u"התחל");
}

TEST_F(TraceLeft, By_closing_the_window_in_the_middle_ends_the_program_without_a_word) {
  const int status = RunTraceWhile([] {
    for (QWidget* window : QApplication::topLevelWidgets())
      if (window->isVisible()) window->close();
  });

  EXPECT_EQ(status, 0);
  EXPECT_FALSE(hasReturned);
  EXPECT_FALSE(reportSeen.empty());
  EXPECT_EQ(Report(), reportSeen);
}

} // namespace quendra::integration

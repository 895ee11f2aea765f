#include "forms/headless/posix/PolledDesktop.h"
#include "forms/qt/QtDesktop.h"
#include "integration/MonitoredDownload.h"
#include "integration/RawFrames.h"
#include "platform/linux/capture/LinuxCapture.h"

#include <QAbstractButton>
#include <QMessageBox>
#include <QTimer>

#include <chrono>

namespace quendra::integration {

namespace {

constexpr int kBoxStands = 2500;

/// A desktop whose boxes stand for a while before they are answered.
class HeadlessWithSlowBoxes : public forms::headless::PolledDesktop {
 public:
  HeadlessWithSlowBoxes() {
    OnBox = [this] { WaitFor([] { return false; }, kBoxStands); };
  }
};

class QtWithSlowBoxes : public forms::qt::QtDesktop {
 public:
  QtWithSlowBoxes() : QtDesktop("integration_test") {}

  int MessageBox(const Text& text, int flags, const Text& title) override {
    QTimer::singleShot(kBoxStands, qApp, [] {
      if (auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget()))
        box->buttons().constFirst()->click();
    });
    return QtDesktop::MessageBox(text, flags, title);
  }

  bool WaitFor(const std::function<bool()>& condition, int milliseconds) {
    using Clock = std::chrono::steady_clock;
    const auto end = Clock::now() + std::chrono::milliseconds(milliseconds);
    constexpr int kMostMilliseconds = 5;
    for (;;) {
      if (condition()) return true;
      if (Clock::now() >= end) return false;
      QCoreApplication::processEvents(QEventLoop::AllEvents | QEventLoop::WaitForMoreEvents,
                                      kMostMilliseconds);
    }
  }
};

/// An event of the capture control that opens a box in its first yield.
template <typename TestedDesktop> class HeldUpEvent : public MonitoredDownload {
 protected:
  void SetUp() override {
    MonitoredDownload::SetUp();
    if (IsSkipped()) return;
    // Made after the workers: they are forks, and no toolkit's threads must be lost in them.
    qputenv("QT_QPA_PLATFORM", "offscreen");
    desktop.emplace();
    OpenPage(*desktop);
  }
  void TearDown() override {
    MonitoredDownload::TearDown();
    desktop.reset();
  }
  bool WaitFor(const std::function<bool()>& condition, int milliseconds) override {
    if (desktop) return desktop->WaitFor(condition, milliseconds);
    usleep(1000);
    return condition();
  }

  /// An event finds this work waiting when it yields: the fifth one, on a line that has become busy.
  void InAnEvent(std::function<void()> work) {
    auto& event = program->packetControl.vpacket->PacketReceived;
    event = [this, raise = event, work = std::move(work), count = std::make_shared<int>(0)] {
      deepest = std::max(deepest, ++depth);
      if (++*count == 5) desktop->Post(work);
      raise();
      --depth;
    };
  }

  std::optional<TestedDesktop> desktop;
  int depth = 0;
  int deepest = 0;
};

using Desktops = testing::Types<HeadlessWithSlowBoxes, QtWithSlowBoxes>;
TYPED_TEST_SUITE(HeldUpEvent, Desktops);

} // namespace

TYPED_TEST(HeldUpEvent, While_a_box_stands_in_it_packets_are_charged_and_the_table_is_refreshed) {
  std::uint64_t chargedInBox = 0;
  int ticksInBox = 0;
  this->InAnEvent([&] {
    const auto before = this->Charged(monitor::kDownloadCell);
    const auto tick = this->program->processTable.LastRefreshTick;
    EXPECT_EQ(this->depth, 1);
    this->desktop->MessageBox(u"text", forms::kInformation, u"title");
    chargedInBox = this->Charged(monitor::kDownloadCell) - before;
    ticksInBox = this->program->processTable.LastRefreshTick - tick;
  });

  this->Download().Tell({Order::Kind::Exchange, 160, 100, 2000, 20'000});
  this->Await(this->Download());
  this->Settle();

  const auto charged = this->Charged(monitor::kDownloadCell);
  const auto page = this->ledger->Read();
  EXPECT_EQ(charged, page.byPort.at(this->port).download);
  EXPECT_EQ(this->Charged(monitor::kUploadCell), page.byPort.at(this->port).upload);
  EXPECT_GT(chargedInBox, 100u * 2000);
  EXPECT_GE(ticksInBox, 1900);
  EXPECT_EQ(this->deepest, 2);
  EXPECT_EQ(this->machine->Capture().Counters().droppedByKernel, 0u);
  EXPECT_EQ(this->machine->Capture().Counters().droppedByQueue, 0u);
}

TYPED_TEST(HeldUpEvent, A_frame_too_short_for_a_decoder_ends_its_event_and_not_the_program) {
  RawLink near(LinkedNamespaces::kNearLink);
  for (int i = 0; i < 3; ++i) {
    near.Send(
        EthernetFrame(Ipv4Packet(47, LinkedNamespaces::kNearAddress, 0, LinkedNamespaces::kFarAddress, 0)));
    this->Settle();
  }
  this->Download().Tell({Order::Kind::Exchange, 5, 100, 5000, 50'000});
  this->Await(this->Download());
  this->Settle();

  EXPECT_EQ(this->program->packetAttribution.MalformedFrames(), 3u);
  EXPECT_EQ(this->Charged(monitor::kDownloadCell), this->ledger->Read().byPort.at(this->port).download);
}

} // namespace quendra::integration

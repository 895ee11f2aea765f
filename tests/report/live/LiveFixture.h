#pragma once

#include "app/Program.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "integration/LoopbackNetwork.h"
#include "integration/ScratchHome.h"
#include "platform/linux/LinuxMachine.h"
#include "report/SupportRequests.h"
#include "report/live/Peer.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <optional>

namespace quendra::report {

/// The whole program on this machine, in a network of its own with nothing but loopback.
class LiveReportTest : public testing::Test {
 protected:
  void SetUp() override {
    if (!integration::NetworkNamespace::Possible())
      GTEST_SKIP() << integration::NetworkNamespace::kSkipReason;
    network_.emplace();
    // Servers that drop their rights write here.
    std::filesystem::permissions(folder, std::filesystem::perms::all);
    machine = std::make_unique<platform::linux_::LinuxMachine>(desktop, desktop);
    program = std::make_unique<app::Program>(machine->Operations(), desktop);
  }
  void TearDown() override {
    if (program && program->monitorPage.frameMain.Visible()) desktop.CloseBox(program->frmMenu);
    program.reset();
    machine.reset();
  }

  void OpenPage() {
    program->Start();
    ASSERT_TRUE(desktop.Click(program->frmSplash.Label2));
    ASSERT_TRUE(desktop.Click(program->frmMenu.lblCaption[0]));
    // The body as it was built: nothing runs between its building and this.
    auto& connected = program->supportExchange.Sockets()->Events.Connect;
    connected = [this, handler = connected](const Variant& index) {
      handler(index);
      if (index == Variant(std::int16_t{3}))
        bodySent = ToCodePage(
            ReportBody(program->supportExchange.ReportNumber, program->monitorPage.table.main_ListView1));
    };
  }
  /// A click and what comes of it; true once that many boxes have stood.
  bool ClickAndAwaitBoxes(std::size_t boxes) {
    desktop.Click(program->monitorPage.reporting.main_cmdRpt);
    return AwaitBoxes(boxes);
  }
  bool AwaitBoxes(std::size_t boxes) {
    return Await([&] { return desktop.Boxes.size() >= boxes; });
  }
  bool Await(const std::function<bool()>& condition) { return desktop.WaitFor(condition, 10'000); }
  foundation::SocketState StateOf(std::int16_t index) {
    return program->supportExchange.Sockets()->State(index);
  }

  std::string Write(const std::string& name, const std::string& content, bool isProgram = false) const {
    const std::string path = folder + "/" + name;
    std::filesystem::create_directories(std::filesystem::path(path).parent_path());
    std::filesystem::permissions(std::filesystem::path(path).parent_path(), std::filesystem::perms::all);
    std::ofstream(path, std::ios::binary) << content;
    if (isProgram) std::filesystem::permissions(path, std::filesystem::perms(0755));
    return path;
  }
  static std::string ContentOf(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
  }
  /// The content of the only file in a folder.
  static std::string ContentOfOnlyFileIn(const std::string& path) {
    std::vector<std::filesystem::path> files;
    for (const auto& entry : std::filesystem::directory_iterator(path)) files.push_back(entry.path());
    EXPECT_EQ(files.size(), 1u);
    return files.empty() ? std::string() : ContentOf(files.front());
  }

  const Text kNumberIs = u"מספר הדו\"ח שלך הוא: ";
  const Text kSuccess = u"הדו\"ח נשלח בהצלחה.";
  const Text kFailure = u"בעיה בשליחת הדו\"ח!";

 private:
  std::optional<integration::LoopbackNetwork> network_;
  integration::ScratchHome home_;

 protected:
  const std::string& folder = home_.Path();
  std::string bodySent;
  forms::headless::PolledDesktop desktop;
  std::unique_ptr<platform::linux_::LinuxMachine> machine;
  std::unique_ptr<app::Program> program;
};

} // namespace quendra::report

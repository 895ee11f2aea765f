#include "LayerRulesFixture.h"

#include <gtest/gtest.h>

namespace quendra::architecture {
namespace {

bool IsAllowed(const std::string& path, const std::string& line) {
  return ViolationsOf({path, line + "\n"}).empty();
}

struct Case {
  const char* path;
  const char* line;
};

TEST(LayerRules, An_include_that_goes_down_is_allowed) {
  const Case cases[] = {
      {"monitor/ProcessTable.h", "#include \"monitor/TableControls.h\""},
      {"monitor/ProcessTable.h", "#include \"forms/ListView.h\""},
      {"monitor/ProcessTable.h", "#include \"platform/process/Processes.h\""},
      {"capture/PacketAttribution.h", "#include \"monitor/TableControls.h\""},
      {"report/Report.cpp", "#include \"monitor/ProcessRow.h\""},
      {"provisioning/mdlDun.cpp", "#include \"diagnostics/mdlPing.h\""},
      {"provisioning/mdlDun.cpp", "#include \"mail/mdlEmail.h\""},
      {"shell/frmMenu.h", "#include \"capture/CaptureSession.h\""},
      {"app/main_linux.cpp", "#include \"platform/linux/LinuxMachine.h\""},
      {"app/main_linux.cpp", "#include \"forms/qt/QtDesktop.h\""},
      {"foundation/CSocketPlus.h", "#include \"platform/net/Sockets.h\""},
      {"forms/qt/QtDesktop.h", "#include \"platform/EventLoop.h\""},
      {"forms/headless/HeadlessLoop.h", "#include \"platform/EventLoop.h\""},
      {"forms/qt/QtDesktop.cpp", "#include <QApplication>"},
      {"forms/headless/posix/PolledDesktop.h", "#include \"forms/headless/HeadlessDesktop.h\""},
      {"forms/headless/posix/PolledDesktop.cpp", "#include <poll.h>"},
      {"platform/linux/capture/LinuxCapture.cpp", "#include <pcap/pcap.h>"},
      {"winapi/Winapi.h", "#include <windows.h>"},
      {"platform/windows/WindowsMachine.cpp", "#include <winsock.h>"},
      {"platform/windows/WindowsMachine.cpp", "#include \"winapi/SystemLibrary.h\""},
      {"forms/win32/Win32Desktop.cpp", "#include \"winapi/Winapi.h\""},
      {"platform/linux/LinuxMachine.cpp", "#include \"platform/unavailable/UnavailableHandles.h\""},
      {"runtime/Text.cpp", "  #  include <string>  // why"},
  };
  for (const Case& row : cases) EXPECT_TRUE(IsAllowed(row.path, row.line)) << row.path << ": " << row.line;
}

TEST(LayerRules, An_include_that_goes_up_or_sideways_is_found) {
  const Case cases[] = {
      {"runtime/Text.h", "#include \"forms/Form.h\""},
      {"forms/Form.h", "#include \"platform/EventLoop.h\""},
      {"platform/Machine.h", "#include \"forms/Form.h\""},
      {"foundation/CSocketPlus.h", "#include \"monitor/ProcessRow.h\""},
      {"monitor/ProcessTable.h", "#include \"capture/CaptureSession.h\""},
      {"monitor/ProcessTable.h", "#include \"shell/frmMenu.h\""},
      {"mail/mdlEmail.h", "#include \"provisioning/mdlDun.h\""},
      {"diagnostics/mdlPing.h", "#include \"monitor/ProcessRow.h\""},
      {"report/Report.h", "#include \"capture/clsIP.h\""},
      {"shell/frmMenu.h", "#include \"app/Program.h\""},
      {"forms/qt/QtDesktop.h", "#include \"platform/Machine.h\""},
      {"forms/headless/HeadlessLoop.h", "#include \"platform/process/Processes.h\""},
      {"platform/linux/LinuxMachine.h", "#include \"forms/Form.h\""},
      {"platform/simulated/SimulatedMachine.h", "#include \"monitor/ProcessRow.h\""},
      {"platform/linux/LinuxMachine.cpp", "#include \"winapi/Winapi.h\""},
      {"winapi/SystemLibrary.h", "#include \"platform/net/Sockets.h\""},
  };
  for (const Case& row : cases) EXPECT_FALSE(IsAllowed(row.path, row.line)) << row.path << ": " << row.line;
}

TEST(LayerRules, The_whole_machine_is_named_by_the_program_and_its_backends_alone) {
  const std::string include = "#include \"platform/Machine.h\"";
  for (const char* path : {"app/Program.h", "platform/linux/LinuxMachine.h", "platform/Machine.cpp"})
    EXPECT_TRUE(IsAllowed(path, include)) << path;
  for (const char* path : {"monitor/ProcessTable.h", "capture/CaptureSession.h", "report/SupportExchange.h",
                           "foundation/modSocketPlus.h", "diagnostics/SurfPage.h", "shell/frmMenu.h"})
    EXPECT_FALSE(IsAllowed(path, include)) << path;
}

TEST(LayerRules, A_backend_that_is_named_outside_app_is_found) {
  const Case cases[] = {
      {"shell/frmMenu.h", "#include \"forms/qt/QtDesktop.h\""},
      {"monitor/ProcessTable.h", "#include \"platform/simulated/SimulatedMachine.h\""},
      {"forms/Desktop.cpp", "#include \"forms/headless/HeadlessDesktop.h\""},
      {"platform/Machine.h", "#include \"platform/linux/LinuxMachine.h\""},
      {"forms/headless/HeadlessDesktop.h", "#include \"forms/qt/QtDesktop.h\""},
      {"forms/headless/HeadlessDesktop.h", "#include \"forms/headless/posix/PolledDesktop.h\""},
      {"platform/simulated/SimulatedMachine.h", "#include \"platform/linux/LinuxMachine.h\""},
      {"platform/Machine.h", "#include \"platform/unavailable/UnavailableMachine.h\""},
      {"platform/unavailable/UnavailableMachine.h", "#include \"platform/linux/LinuxMachine.h\""},
  };
  for (const Case& row : cases) EXPECT_FALSE(IsAllowed(row.path, row.line)) << row.path << ": " << row.line;
}

TEST(LayerRules, A_header_of_a_system_or_toolkit_outside_its_backend_is_found) {
  const Case cases[] = {
      {"monitor/ProcessTable.cpp", "#include <unistd.h>"},
      {"runtime/CodePage.cpp", "#include <iconv.h>"},
      {"capture/CaptureSession.cpp", "#include <pcap/pcap.h>"},
      {"shell/frmMenu.cpp", "#include <windows.h>"},
      {"platform/windows/WindowsMachine.cpp", "#include <windows.h>"}, // renames our functions
      {"forms/Form.h", "#include <QWidget>"},
      {"forms/Form.h", "#include <QtGlobal>"},
      {"platform/linux/LinuxMachine.cpp", "#include <QSocketNotifier>"},
      {"forms/qt/QtDesktop.cpp", "#include <sys/socket.h>"},
      {"forms/headless/HeadlessLoop.cpp", "#include <poll.h>"},
      {"forms/headless/HeadlessLoop.cpp", "#include <sys/socket.h>"},
      {"forms/headless/posix/PolledDesktop.cpp", "#include <QSocketNotifier>"},
      {"platform/simulated/SimulatedMachine.cpp", "#include <netinet/in.h>"},
      {"runtime/Text.cpp", "#include <iconv.h>"},
      {"app/main_linux.cpp", "#include <QApplication>"},
      {"runtime/Text.cpp", "#include <string.h>"},
  };
  for (const Case& row : cases) EXPECT_FALSE(IsAllowed(row.path, row.line)) << row.path << ": " << row.line;
}

TEST(LayerRules, Threads_above_the_backends_are_found) {
  for (const std::string header : {"mutex", "shared_mutex", "thread", "condition_variable", "future",
                                   "semaphore", "latch", "barrier", "stop_token"}) {
    const std::string line = "#include <" + header + ">";
    for (const char* path : {"runtime/Text.cpp", "forms/Form.h", "platform/Machine.h", "capture/Sniffer.cpp",
                             "forms/headless/HeadlessLoop.h", "platform/simulated/SimulatedMachine.cpp"})
      EXPECT_FALSE(IsAllowed(path, line)) << path << ": " << line;
    for (const char* path : {"forms/qt/loop/QtEventLoop.h", "platform/linux/net/NameLookUps.cpp",
                             "forms/headless/posix/PolledDesktop.h", "platform/windows/WindowsMachine.cpp"})
      EXPECT_TRUE(IsAllowed(path, line)) << path << ": " << line;
  }
}

TEST(LayerRules, An_atomic_number_of_64_bits_above_the_backends_is_found) {
  for (const char* line : {"  std::atomic<std::int64_t> bytes;", "std::atomic< uint64_t > bytes;",
                           "std::atomic<unsigned long long> bytes;", "std::atomic_uint64_t bytes;",
                           "std::atomic<double> rate;", "std::atomic_ref<std::uint64_t> view(bytes);"}) {
    EXPECT_FALSE(IsAllowed("capture/dormant/Sniffer.h", line)) << line;
    EXPECT_TRUE(IsAllowed("platform/linux/capture/PcapSession.h", line)) << line;
  }
  for (const char* line : {"std::atomic<bool> posted;", "std::atomic<std::uint32_t> ticks;",
                           "std::vector<std::int64_t> bytes;", "// no std::atomic<std::int64_t> here"})
    EXPECT_TRUE(IsAllowed("capture/dormant/Sniffer.h", line)) << line;
}

TEST(LayerRules, An_include_that_is_not_written_from_src_is_found) {
  EXPECT_FALSE(IsAllowed("monitor/ProcessTable.cpp", "#include \"ProcessTable.h\""));
  EXPECT_FALSE(IsAllowed("monitor/ProcessTable.cpp", "#include \"../forms/Form.h\""));
  EXPECT_FALSE(IsAllowed("monitor/ProcessTable.cpp", "#include HEADER_OF_THE_SYSTEM"));
  EXPECT_FALSE(IsAllowed("elsewhere/File.h", ""));
}

TEST(LayerRules, A_condition_on_an_operating_system_above_the_backends_is_found) {
  const Case cases[] = {
      {"shell/frmMenu.cpp", "#ifdef _WIN32"},
      {"runtime/CodePage.cpp", "#if defined(__linux__)"},
      {"forms/Form.h", "#elif defined(__APPLE__)"},
      {"capture/clsIP.cpp", "# ifndef Q_OS_WIN"},
      {"monitor/Rates.cpp", "#if __has_include(<unistd.h>)"},
      {"app/main_linux.cpp", "#ifdef __unix__"},
      {"platform/Machine.h", "#ifdef WIN32"},
      {"platform/Machine.h", "#if defined(linux)"},
  };
  for (const Case& row : cases) EXPECT_FALSE(IsAllowed(row.path, row.line)) << row.path << ": " << row.line;
}

TEST(LayerRules, Other_conditions_and_those_of_backends_are_allowed) {
  EXPECT_TRUE(IsAllowed("runtime/Text.cpp", "#if defined(__cpp_lib_to_chars)"));
  EXPECT_TRUE(IsAllowed("platform/linux/capture/LinuxCapture.cpp", "#ifdef __linux__"));
  EXPECT_TRUE(IsAllowed("monitor/Rates.cpp", "// the #ifdef _WIN32 of old is gone"));
}

TEST(LayerRules, A_violation_is_told_with_its_place) {
  const auto violations = ViolationsOf({"runtime/Text.h", "#pragma once\n\n#include \"forms/Form.h\"\n"});

  ASSERT_EQ(violations.size(), 1U);
  EXPECT_EQ(violations[0], "runtime/Text.h:3: #include \"forms/Form.h\" goes against the layers");
}

} // namespace
} // namespace quendra::architecture

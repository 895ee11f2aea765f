#include "app/Program.h"
#include "forms/headless/posix/PolledDesktop.h"
#include "integration/ScratchHome.h"
#include "platform/linux/LinuxMachine.h"
#include "platform/linux/internet/CacheFilesFixture.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

namespace quendra::diagnostics {
namespace {

namespace files = std::filesystem;

/// The check of the cache on real files, in user folders of the test's own.
class CacheLive : public testing::Test {
 protected:
  CacheLive() {
    files::create_directories(Firefox());
    files::create_directories(Chromium());
    rows.Add(u"cache", u"");
  }

  std::string Firefox() const { return folder + "/caches/mozilla/firefox/a.default/cache2/entries/"; }
  std::string Chromium() const { return folder + "/caches/chromium/Default/Cache/Cache_Data/"; }
  /// The name of an entry's file, by number.
  static std::string Digits(std::size_t length, int number) {
    const std::string digits = std::to_string(number);
    return std::string(length - digits.size(), '0') + digits;
  }
  void WriteFirefox(int number, const std::string& content) const {
    std::ofstream(Firefox() + Digits(40, number), std::ios::binary) << content;
  }
  void WriteChromium(int number, const std::string& content) const {
    std::ofstream(Chromium() + Digits(16, number) + "_0", std::ios::binary) << content;
  }
  int FileCount() const {
    int count = 0;
    for (const auto& entry : files::recursive_directory_iterator(folder + "/caches"))
      count += entry.is_regular_file() ? 1 : 0;
    return count;
  }
  /// As from a handler of the page.
  void Run() {
    bool hasRun = false;
    desktop.Post([&] {
      program.surf.localChecks.cache.Run(rows);
      hasRun = true;
    });
    ASSERT_TRUE(desktop.WaitFor([&] { return hasRun || desktop.Ended; }, 30'000));
  }

  const integration::ScratchHome home;
  const std::string& folder = home.Path();
  forms::headless::PolledDesktop desktop;
  platform::linux_::LinuxMachine machine{desktop, desktop};
  app::Program program{machine.Operations(), desktop};
  CheckRows rows{program.surfPage.surf_ListView1, desktop};
};

TEST_F(CacheLive, Entries_of_both_forms_go_and_those_with_cookies_stay) {
  for (int i = 0; i < 50; ++i) {
    WriteFirefox(i, platform::linux_::FirefoxFile(":http://a/" + std::to_string(i)));
    WriteChromium(i, platform::linux_::ChromiumFile("http://b/" + std::to_string(i)));
  }
  WriteFirefox(50, platform::linux_::FirefoxFile(":http://a/Cookie"));
  WriteChromium(50, platform::linux_::ChromiumFile("http://b/Cookies?all"));

  Run();

  EXPECT_EQ(program.surfPage.surf_ListView1.Row(1).CellText(1), u"102/102");
  EXPECT_EQ(FileCount(), 2);
  EXPECT_TRUE(files::exists(Firefox() + Digits(40, 50)));
  EXPECT_TRUE(files::exists(Chromium() + Digits(16, 50) + "_0"));
}

TEST_F(CacheLive, More_entries_than_32767_end_the_program_with_the_run_times_box_and_all_stay) {
  for (int i = 0; i < 16384; ++i) {
    WriteFirefox(i, "");
    WriteChromium(i, "");
  }

  Run();

  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_EQ(desktop.Boxes[0].text, u"Run-time error '6':\n\nOverflow");
  EXPECT_EQ(desktop.EndStatus, 1);
  EXPECT_EQ(FileCount(), 32768);
}

} // namespace
} // namespace quendra::diagnostics

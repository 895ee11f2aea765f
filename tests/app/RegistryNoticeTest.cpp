#include "app/RegistryNotice.h"

#include "forms/headless/HeadlessDesktop.h"

#include <gtest/gtest.h>

namespace quendra::app {
namespace {

using forms::headless::HeadlessDesktop;

TEST(RegistryNoticeTest, The_subscriber_reads_once_where_the_damaged_file_is_kept) {
  HeadlessDesktop desktop;
  const RegistryNotice tell(desktop, desktop);

  tell("/home/דנה/registry.sqlite.damaged-1");
  desktop.RunUntilIdle();

  ASSERT_EQ(desktop.Boxes.size(), 1U);
  EXPECT_EQ(desktop.Boxes[0],
            (HeadlessDesktop::Box{u"קובץ ההגדרות של התוכנה נמצא פגום, ובמקומו נפתח קובץ חדש.\r\n"
                                  u"הקובץ הפגום נשמר כאן:\r\n"
                                  u"/home/דנה/registry.sqlite.damaged-1",
                                  0x180030, u"זלמר בינלאומי@נט"}));
}

TEST(RegistryNoticeTest, The_box_waits_until_the_work_under_way_lets_events_in) {
  HeadlessDesktop desktop;
  const RegistryNotice tell(desktop, desktop);

  tell("/a");

  EXPECT_TRUE(desktop.Boxes.empty());
  desktop.DoEvents();
  EXPECT_EQ(desktop.Boxes.size(), 1U);
}

} // namespace
} // namespace quendra::app

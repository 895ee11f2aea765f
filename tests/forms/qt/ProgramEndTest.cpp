#include "forms/qt/QtFixture.h"

namespace quendra::forms::qt {

class ProgramEnd : public QtFixture {};

TEST_F(ProgramEnd, End_unwinds_the_handler_and_gives_its_status_without_unloading) {
  bool wentOn = false;
  bool unloaded = false;
  form.unload = [&] { unloaded = true; };

  const int status = desktop.Run([&] {
    desktop.Show(form);
    desktop.End(3);
    wentOn = true;
  });

  EXPECT_EQ(status, 3);
  EXPECT_FALSE(wentOn);
  EXPECT_FALSE(unloaded);
  EXPECT_EQ(form.View(), nullptr);
}

} // namespace quendra::forms::qt

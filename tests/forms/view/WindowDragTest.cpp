#include "forms/view/WindowDrag.h"

#include <gtest/gtest.h>

namespace quendra::forms {
namespace {

using By = WindowDrag::By;
using MouseEvent = WindowDrag::MouseEvent;

TEST(WindowDrag, Takes_nothing_before_it_starts) {
  WindowDrag drag;

  EXPECT_FALSE(drag.Takes(MouseEvent::Move, true));
  EXPECT_FALSE(drag.Takes(MouseEvent::Release, false));
}

TEST(WindowDrag, Keeps_the_window_under_the_mouse_where_it_was_taken) {
  WindowDrag drag;

  drag.Start(By::Desktop, {110, 60}, {100, 50});

  EXPECT_TRUE(drag.Takes(MouseEvent::Move, true));
  EXPECT_TRUE(drag.MovesWindow());
  EXPECT_EQ(drag.WindowAt({130, 75}), (Spot{120, 65}));
}

TEST(WindowDrag, Leaves_the_window_to_a_window_manager_and_takes_the_moves_that_were_on_their_way) {
  WindowDrag drag;

  drag.Start(By::WindowManager, {110, 60}, {100, 50});

  EXPECT_TRUE(drag.Takes(MouseEvent::Move, true));
  EXPECT_FALSE(drag.MovesWindow());
}

TEST(WindowDrag, Ends_with_the_release_which_belongs_to_it) {
  WindowDrag drag;
  drag.Start(By::Desktop, {}, {});

  EXPECT_TRUE(drag.Takes(MouseEvent::Release, false));
  EXPECT_FALSE(drag.MovesWindow());
  EXPECT_FALSE(drag.Takes(MouseEvent::Move, true));
}

TEST(WindowDrag, Ends_with_a_move_without_the_button_or_a_press_which_go_to_the_controls) {
  for (const MouseEvent event : {MouseEvent::Move, MouseEvent::Press}) {
    WindowDrag drag;
    drag.Start(By::WindowManager, {}, {});
    EXPECT_FALSE(drag.Takes(event, event == MouseEvent::Press));
    EXPECT_FALSE(drag.Takes(MouseEvent::Release, false));
  }
}

} // namespace
} // namespace quendra::forms

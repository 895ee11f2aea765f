#include "forms/qt/QtFixture.h"

#include <QEvent>

namespace quendra::forms::qt {

/// A rule on a page of the form, hidden at first, and how often it was drawn.
class Repaint : public QtFixture {
 protected:
  struct Painted : QObject {
    bool eventFilter(QObject*, QEvent* event) override {
      if (event->type() == QEvent::Paint) ++count;
      return false;
    }
    int count = 0;
  };

  void ShowWithHiddenRule() {
    form.design = [this] {
      page.Move(0, 0, 6000, 4500);
      rule.Move(300, 300, 3000, 15);
      rule.Visible = false;
    };
    ShowActive();
    ASSERT_TRUE(RunUntil([this] { return WidgetOf(form).testAttribute(Qt::WA_Mapped); }));
    WidgetOf(rule).installEventFilter(&painted);
  }

  Frame page{form, u"page"};
  PictureBox rule{page, u"rule"};
  Painted painted;
};

TEST_F(Repaint, Of_a_form_draws_what_was_shown_on_it_while_the_thread_is_held) {
  ShowWithHiddenRule();

  rule.Visible = true;
  desktop.Repaint(form);

  EXPECT_EQ(painted.count, 1);
}

TEST_F(Repaint, Of_a_form_draws_what_was_moved_on_it_while_the_thread_is_held) {
  ShowWithHiddenRule();
  rule.Visible = true;
  desktop.Repaint(form);

  rule.Move(300, 600, 3000, 15);
  desktop.Repaint(form);

  EXPECT_EQ(painted.count, 2);
}

TEST_F(Repaint, Of_a_form_leaves_what_is_hidden_alone) {
  ShowWithHiddenRule();

  desktop.Repaint(form);

  EXPECT_EQ(painted.count, 0);
}

} // namespace quendra::forms::qt

#include "forms/qt/QtFixture.h"

#include <QMessageBox>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QScreen>
#include <QScrollBar>
#include <QTimer>

namespace quendra::forms::qt {

/// How message boxes lie on the screen, whatever their text.
class Boxes : public QtFixture {
 protected:
  struct Seen {
    QSize box;
    QRect button; ///< in the box
    bool buttonHasFocus = false;
    bool isScrolled = false; ///< the text stands in a field of its own
    int hiddenBelow = 0;     ///< how far that can be scrolled, in lines
    QString text;
    bool beginsAtRight = false; ///< where its first letter stands
    Qt::LayoutDirection direction = Qt::LayoutDirectionAuto;
  };

  Seen Show(const Text& text, int flags = kInformation | kHebrewBox) {
    Seen seen;
    LookAtBox(seen);
    desktop.MessageBox(text, flags, u"title");
    return seen;
  }
  static bool IsOnScreen(const Seen& seen) {
    const QSize screen = QGuiApplication::primaryScreen()->availableSize();
    return seen.box.width() < screen.width() && seen.box.height() < screen.height() &&
           QRect(QPoint(), seen.box).contains(seen.button);
  }

 private:
  void LookAtBox(Seen& seen) {
    QTimer::singleShot(0, qApp, [this, &seen] {
      const auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
      if (!box || !box->isVisible()) return LookAtBox(seen);
      QAbstractButton* button = box->buttons().constFirst();
      seen.box = box->size();
      seen.button = button->geometry().translated(button->parentWidget()->mapTo(box, QPoint()));
      seen.buttonHasFocus = box->focusWidget() == button;
      if (const auto* field = box->findChild<QPlainTextEdit*>()) {
        seen.isScrolled = field->isVisible();
        seen.hiddenBelow = field->verticalScrollBar()->maximum();
        seen.text = field->toPlainText();
        seen.beginsAtRight = field->cursorRect().x() > field->viewport()->width() / 2;
        seen.direction = field->document()->defaultTextOption().textDirection();
      }
      button->click();
    });
  }
};

TEST_F(Boxes, Belong_to_the_form_that_the_user_is_not_kept_from_when_none_is_active) {
  std::vector<std::unique_ptr<TestForm>> others;
  TestForm modal;
  for (int i = 0; i < 8; ++i) desktop.Show(*others.emplace_back(std::make_unique<TestForm>()));
  const QWidget* owner = nullptr;
  desktop.Post([&] {
    QApplication::setActiveWindow(nullptr);
    const auto looks = desktop.StartTimer(1, [&] {
      auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
      if (!box) return;
      owner = box->parentWidget();
      box->buttons().constFirst()->click();
    });
    desktop.MessageBox(u"text", 0, u"title");
    modal.Visible = false;
  });

  desktop.Show(modal, Modality::Modal);

  EXPECT_EQ(owner, &WidgetOf(modal));
}

TEST_F(Boxes, Show_a_short_text_whole) {
  const Seen seen = Show(u"נתוני IP:\r\n1: 10.0.0.5\r\n2: 10.0.0.138\r\n3: 127.0.0.1");

  EXPECT_FALSE(seen.isScrolled);
  EXPECT_TRUE(IsOnScreen(seen));
}

TEST_F(Boxes, Keep_their_button_on_the_screen_under_4096_line_ends) {
  const Seen seen = Show(Text(4096, u'\n'));

  EXPECT_TRUE(IsOnScreen(seen)) << seen.box.width() << " by " << seen.box.height();
  EXPECT_TRUE(seen.isScrolled);
  EXPECT_GT(seen.hiddenBelow, 4000);
}

TEST_F(Boxes, Keep_their_button_on_the_screen_under_one_long_line_without_blanks) {
  const Seen seen = Show(Text(4096, u'W'));

  EXPECT_TRUE(IsOnScreen(seen)) << seen.box.width() << " by " << seen.box.height();
  EXPECT_TRUE(seen.isScrolled);
}

TEST_F(Boxes, Keep_their_button_on_the_screen_under_one_long_line_with_blanks) {
  Text words;
  while (words.size() < 4000) words += u"מילה ";

  const Seen seen = Show(words);

  EXPECT_TRUE(IsOnScreen(seen)) << seen.box.width() << " by " << seen.box.height();
}

TEST_F(Boxes, Grow_no_larger_than_a_long_word_needs) {
  const Seen seen = Show(Text(150, u'W'));

  EXPECT_TRUE(seen.isScrolled);
  EXPECT_EQ(seen.hiddenBelow, 0);
  EXPECT_LT(seen.box.height(), 300);
}

TEST_F(Boxes, Hold_the_whole_text_in_the_field_that_scrolls_it) {
  Text lines;
  for (int line = 0; line < 200; ++line) lines += DecimalText(line) + u"\r\n";

  const Seen seen = Show(lines + u"end", kExclamation);

  EXPECT_TRUE(seen.text.startsWith(QStringLiteral("0\n1\n2\n")));
  EXPECT_TRUE(seen.text.endsWith(QStringLiteral("199\nend")));
}

TEST_F(Boxes, Scroll_a_text_in_the_direction_of_its_box) {
  const Text tall(500, u'\n');

  EXPECT_EQ(Show(tall, kInformation | kHebrewBox).direction, Qt::RightToLeft);
  EXPECT_EQ(Show(tall, kExclamation).direction, Qt::LeftToRight);
}

TEST_F(Boxes, Begin_a_scrolled_text_at_the_side_where_it_is_read) {
  EXPECT_TRUE(Show(u"מספר" + Text(500, u'\n'), kInformation | kHebrewBox).beginsAtRight);
  EXPECT_FALSE(Show(u"text" + Text(500, u'\n'), kExclamation).beginsAtRight);
}

TEST_F(Boxes, Give_the_focus_to_their_button_and_not_to_the_text) {
  EXPECT_TRUE(Show(u"text").buttonHasFocus);
  EXPECT_TRUE(Show(Text(500, u'\n')).buttonHasFocus);
}

} // namespace quendra::forms::qt

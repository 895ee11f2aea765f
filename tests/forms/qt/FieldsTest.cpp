#include "forms/qt/QtFixture.h"

#include "forms/qt/views/ComboBoxView.h"
#include "forms/qt/views/ListViewView.h"
#include "forms/qt/views/TextAreaView.h"
#include "forms/qt/views/TextLineView.h"
#include "forms/view/Palette.h"

#include <QAccessible>
#include <QClipboard>
#include <QInputMethodEvent>
#include <QMessageBox>
#include <QScrollBar>
#include <QTextBlock>
#include <QTimer>

namespace quendra::forms::qt {

/// Fields for text as the toolkit shows them.
class Fields : public QtFixture {
 protected:
  Fields() {
    form.design = [this] {
      label.Caption = u"כתובת מעקב:";
      label.Move(0, 0, 1500, 300);
      line.Move(150, 300, 3000, 450);
      lines.Move(150, 900, 5000, 1500);
      combo.Move(150, 2700, 3000, 450);
      list.Move(150, 3300, 5000, 1000);
      list.AddColumn({u"name", 1500});
      list.AddColumn({u"result", 1500});
    };
    lines.MultiLine = true;
    lines.VerticalScrollBar = true;
    lines.Monospaced = true;
    combo.FreeText = true;
    combo.AddItem(u"www.one.test");
    list.SmallIcons = &icons;
    icons.Add(Picture::Of({1, 1, {0xFFFF0000}}), {}, u"ico_check");
  }
  TextLineView& Line() { return As<TextLineView>(line); }
  TextAreaView& Lines() { return As<TextAreaView>(lines); }

  Label label{form, u"Label2"};
  TextBox line{form, u"line"};
  TextBox lines{form, u"lines"};
  ComboBox combo{form, u"combo"};
  ListView list{form, u"list"};
  ImageList icons{form, u"icons"};
};

TEST_F(Fields, Copy_is_a_command_that_the_handler_hears_of_by_its_control_character) {
  std::vector<int> pressed;
  line.KeyPress = [&](int& keyCode) { pressed.push_back(keyCode); };
  line.Value = u"text";
  ShowActive();
  line.SelLength = 4;

  PressKey(Line(), Qt::Key_C, QStringLiteral("\x03"), Qt::ControlModifier);

  EXPECT_EQ(pressed, std::vector<int>{3});
  EXPECT_EQ(QGuiApplication::clipboard()->text(), QStringLiteral("text"));
  EXPECT_EQ(line.Value(), u"text");
}

TEST_F(Fields, A_masked_field_shows_one_sign_a_character_and_keeps_the_text_to_itself) {
  line.Masked = true;
  line.Value = u"secret";
  ShowActive();
  line.SelLength = 6;
  QGuiApplication::clipboard()->setText(QStringLiteral("before"));

  PressKey(Line(), Qt::Key_C, QStringLiteral("\x03"), Qt::ControlModifier);
  PressKey(Line(), Qt::Key_End);
  PressKey(Line(), Qt::Key_9, QStringLiteral("9"));

  EXPECT_EQ(line.Value(), u"secret9");
  EXPECT_EQ(Line().displayText().size(), 7);
  EXPECT_FALSE(Line().displayText().contains(QStringLiteral("secret")));
  EXPECT_EQ(QGuiApplication::clipboard()->text(), QStringLiteral("before"));
  line.Masked = false;
  EXPECT_EQ(Line().displayText(), QStringLiteral("secret9"));
}

TEST_F(Fields, A_refused_control_character_pastes_nothing) {
  QGuiApplication::clipboard()->setText(QStringLiteral("pasted"));
  line.KeyPress = [](int& keyCode) { keyCode = 0; };
  ShowActive();

  PressKey(Line(), Qt::Key_V, QStringLiteral("\x16"), Qt::ControlModifier);
  EXPECT_EQ(line.Value(), u"");

  line.KeyPress = nullptr;
  PressKey(Line(), Qt::Key_V, QStringLiteral("\x16"), Qt::ControlModifier);
  EXPECT_EQ(line.Value(), u"pasted");
}

TEST_F(Fields, Delete_and_the_arrows_are_no_key_presses) {
  int pressed = 0;
  line.KeyPress = [&](int&) { ++pressed; };
  line.Value = u"ab";
  ShowActive();

  PressKey(Line(), Qt::Key_Right);
  EXPECT_EQ(line.SelStart(), 1);
  PressKey(Line(), Qt::Key_Delete, QStringLiteral("\x7f"));

  EXPECT_EQ(line.Value(), u"a");
  EXPECT_EQ(pressed, 0);
}

TEST_F(Fields, An_input_methods_text_passes_the_handler_too) {
  line.KeyPress = [](int& keyCode) { keyCode = keyCode == 0x05D0 ? 't' : 0; };
  ShowActive();
  QInputMethodEvent event;
  event.setCommitString(QStringLiteral("\u05D0\u05D1"));

  QCoreApplication::sendEvent(&Line(), &event);

  EXPECT_EQ(line.Value(), u"t");
}

TEST_F(Fields, A_report_follows_its_end_when_its_handler_says_so) {
  lines.Change = [this] { lines.SelStart = static_cast<int>(lines.Value().size()); };
  ShowActive();
  for (int hop = 0; hop < 100; ++hop) lines.Value = lines.Value() + u"Hop #\t1\t<10 ms\t10.0.0.1\r\n";

  EXPECT_EQ(Lines().verticalScrollBar()->value(), Lines().verticalScrollBar()->maximum());
  EXPECT_EQ(Lines().textCursor().position(), Lines().toPlainText().size());
}

TEST_F(Fields, A_report_has_letters_of_one_width_and_reads_each_line_in_its_direction) {
  lines.Value = u"Trace\r\nבדיקה";
  ShowActive();

  EXPECT_EQ(Lines().fontMetrics().horizontalAdvance(u'i'), Lines().fontMetrics().horizontalAdvance(u'W'));
  EXPECT_EQ(Lines().document()->firstBlock().textDirection(), Qt::LeftToRight);
  EXPECT_EQ(Lines().document()->lastBlock().textDirection(), Qt::RightToLeft);
  EXPECT_TRUE(Lines().verticalScrollBar()->isVisible());
}

TEST_F(Fields, Lines_begin_on_the_side_that_the_first_letter_of_them_all_reads_from) {
  const auto beginning = [this] {
    return Lines().cursorRect(QTextCursor(Lines().document()->lastBlock())).left();
  };
  lines.Value = u"\r\nstate 5";
  ShowActive();
  EXPECT_LT(beginning(), 20);

  lines.Value = u"\r\nפעולה: 5";

  EXPECT_GT(beginning(), Lines().viewport()->width() - 20);
}

TEST_F(Fields, A_field_is_named_by_the_label_before_it) {
  ShowActive();

  EXPECT_EQ(Line().accessibleName(), QStringLiteral("כתובת מעקב:"));
  EXPECT_EQ(Line().accessibleDescription(), QStringLiteral("line"));
  EXPECT_EQ(QAccessible::queryAccessibleInterface(&Line())->role(), QAccessible::EditableText);
}

TEST_F(Fields, The_scroll_bar_of_a_report_stands_inside_its_edge) {
  ShowActive();

  const QRect bar(Lines().verticalScrollBar()->mapTo(&Lines(), QPoint()),
                  Lines().verticalScrollBar()->size());

  EXPECT_TRUE(Lines().rect().adjusted(2, 2, -2, -2).contains(bar));
}

TEST_F(Fields, A_combo_box_has_the_ring_of_all_fields_for_those_who_use_the_keys) {
  for (const bool freeText : {true, false}) {
    combo.FreeText = freeText;
    ShowActive();
    QWidget& box = WidgetOf(combo);
    const auto edge = [&] { return box.grab().toImage().pixelColor(box.width() / 2, 1); };
    Line().setFocus();
    const QColor without = edge();

    box.setFocus();
    box.window()->setAttribute(Qt::WA_KeyboardFocusChange);

    EXPECT_EQ(edge(), ToQColor(Palette::Focus)) << freeText;
    EXPECT_NE(edge(), without);
    desktop.Unload(form);
  }
}

TEST_F(Fields, A_chosen_item_stands_in_the_field_without_marks) {
  ShowActive();
  auto& view = As<ComboBoxView>(combo);

  emit view.activated(0);

  EXPECT_EQ(view.lineEdit()->text(), QStringLiteral("www.one.test"));
  EXPECT_EQ(combo.Value(), u"www.one.test");
  EXPECT_EQ(combo.ListIndex(), 0);
}

TEST_F(Fields, A_cell_shows_its_icon_and_tells_assistive_technology_the_icons_key) {
  ListRow& row = list.Add(u"key", u"row", 0);
  row.AddCell({}, Text(), 1);
  ShowActive();
  auto& view = As<ListViewView>(list);
  const QModelIndex cell = view.model()->index(0, 1);
  const QPoint middle = view.viewport()->mapTo(&view, view.visualRect(cell).center());

  EXPECT_EQ(PixelOf(view, middle.x(), middle.y()), QColor(Qt::red));
  EXPECT_EQ(cell.data(Qt::AccessibleDescriptionRole).toString(), QStringLiteral("ico_check"));
}

TEST_F(Fields, What_changes_while_the_thread_is_held_is_drawn_by_a_repaint) {
  struct Painted : QObject {
    bool eventFilter(QObject*, QEvent* event) override {
      if (event->type() == QEvent::Paint) ++count;
      return false;
    }
    int count = 0;
  } painted;
  ShowActive();
  ASSERT_TRUE(RunUntil([this] { return WidgetOf(form).testAttribute(Qt::WA_Mapped); }));
  auto& view = As<ListViewView>(list);
  view.viewport()->installEventFilter(&painted);

  list.Add(u"key", u"row", 0);
  desktop.Repaint(list);

  EXPECT_EQ(painted.count, 1);
  EXPECT_FALSE(view.visualRect(view.model()->index(0, 0)).isEmpty());
}

TEST_F(Fields, Escape_leaves_a_question_standing_and_Enter_answers_it_by_yes) {
  ShowActive();
  bool stoodAfterEscape = false;
  std::function<void()> press = [&] {
    auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
    if (!box || !box->isVisible()) return QTimer::singleShot(1, qApp, press);
    PressKey(*box, Qt::Key_Escape, QStringLiteral("\x1b"));
    stoodAfterEscape = box->isVisible();
    PressKey(*box->focusWidget(), Qt::Key_Return, QStringLiteral("\r"));
  };
  QTimer::singleShot(1, qApp, press);

  EXPECT_EQ(desktop.MessageBox(u"text", kQuestion | kYesNo | kHebrewBox, u"title"), 6);
  EXPECT_TRUE(stoodAfterEscape);
}

} // namespace quendra::forms::qt

#include "forms/qt/QtFixture.h"

#include "forms/qt/input/KeyEvents.h"

#include <QKeyEvent>
#include <QTreeView>

namespace quendra::forms::qt {

class Keyboard : public QtFixture {
 protected:
  static constexpr int kHebrewFinalNun = 0x05DF;
  static constexpr quint32 kFinalNunSymbol = 0xCEF;

  /// As the display server tells it: without a word on whether the key is held.
  static void SendKey(QWidget& widget, QEvent::Type type, int key, quint64 moment) {
    QKeyEvent event(type, key, Qt::NoModifier);
    event.setTimestamp(moment);
    QCoreApplication::sendEvent(&widget, &event);
  }
  void SendEscape(QEvent::Type type, quint64 moment) {
    SendKey(WidgetOf(form), type, Qt::Key_Escape, moment);
  }
  static void MakeButtons(std::initializer_list<Label*> labels) {
    for (Label* label : labels) label->Click = [] {};
  }
  /// The names of the next three controls that Tab reaches from one.
  QStringList ReachedByTab(const Control& from) {
    ShowActive();
    WidgetOf(from).setFocus();
    QStringList reached;
    for (int i = 0; i < 3; ++i) {
      PressKey(*QApplication::focusWidget(), Qt::Key_Tab, QStringLiteral("\t"));
      reached.push_back(QApplication::focusWidget()->objectName());
    }
    return reached;
  }
};

/// A form with a picture that Escape clicks.
struct PictureToCancel {
  explicit PictureToCancel(Form& form) : picture(form, u"picture") {
    picture.Click = [this] { ++clicks; };
    form.Cancel = &picture;
  }

  Image picture;
  int clicks = 0;
};

TEST_F(Keyboard, Tab_reaches_every_clickable_label_and_no_other) {
  Frame frame(form, u"frame");
  Label first(frame, u"first");
  Label text(frame, u"text");
  Label second(frame, u"second");
  PictureBox box(form, u"box");
  Label third(box, u"third");
  MakeButtons({&first, &second, &third});

  EXPECT_EQ(ReachedByTab(first),
            QStringList({QStringLiteral("second"), QStringLiteral("third"), QStringLiteral("first")}));
}

TEST_F(Keyboard, Tab_passes_over_what_a_panel_lies_over_in_both_directions) {
  Label under(form, u"under");
  Label beside(form, u"beside");
  Frame panel(form, u"panel");
  TextBox within(panel, u"within");
  MakeButtons({&under, &beside});
  beside.Move(3000, 0, 300, 300);
  panel.Move(0, 0, 1500, 1500);

  EXPECT_EQ(ReachedByTab(within),
            QStringList({QStringLiteral("beside"), QStringLiteral("within"), QStringLiteral("beside")}));
  PressKey(*QApplication::focusWidget(), Qt::Key_Backtab);
  EXPECT_EQ(QApplication::focusWidget()->objectName(), QStringLiteral("within"));
}

TEST_F(Keyboard, A_form_shows_the_ring_at_once_to_those_who_opened_it_by_the_keys) {
  ShowActive();
  for (const bool byKeys : {true, false}) {
    TestForm dialog;
    WidgetOf(form).setAttribute(Qt::WA_KeyboardFocusChange, byKeys);

    desktop.Show(dialog, Modality::Modeless, &form);

    EXPECT_EQ(WidgetOf(dialog).testAttribute(Qt::WA_KeyboardFocusChange), byKeys);
    desktop.Unload(dialog);
  }
}

TEST_F(Keyboard, Enter_and_Space_press_a_label) {
  Label label(form, u"label");
  int clicks = 0;
  label.Click = [&] { ++clicks; };
  ShowActive();
  WidgetOf(label).setFocus();

  PressKey(WidgetOf(label), Qt::Key_Return, QStringLiteral("\r"));
  EXPECT_EQ(clicks, 1);
  PressKey(WidgetOf(label), Qt::Key_Enter, QStringLiteral("\r"));
  EXPECT_EQ(clicks, 2);
  PressKey(WidgetOf(label), Qt::Key_Space, QStringLiteral(" "));
  EXPECT_EQ(clicks, 3);
  PressKey(WidgetOf(label), Qt::Key_A, QStringLiteral("a"));
  EXPECT_EQ(clicks, 3);
}

TEST_F(Keyboard, The_focus_ring_shows_for_those_who_use_the_keys) {
  Label label(form, u"label");
  label.Click = [] {};
  form.design = [&] { label.Move(0, 0, 1500, 450); };
  ShowActive();
  WidgetOf(form).setAttribute(Qt::WA_KeyboardFocusChange, false);
  WidgetOf(label).setFocus();
  const QColor without = PixelOf(WidgetOf(label), 50, 1);

  WidgetOf(form).setAttribute(Qt::WA_KeyboardFocusChange, true);

  EXPECT_NE(PixelOf(WidgetOf(label), 50, 1), without);
}

TEST_F(Keyboard, The_focus_ring_goes_when_the_mouse_is_used) {
  Label label(form, u"label");
  label.Click = [] {};
  ShowActive();
  WidgetOf(form).setAttribute(Qt::WA_KeyboardFocusChange, true);

  PressMouse(WidgetOf(label), {1, 1});

  EXPECT_FALSE(WidgetOf(form).testAttribute(Qt::WA_KeyboardFocusChange));
}

TEST_F(Keyboard, Ctrl_and_I_in_the_Latin_layout_give_an_upper_case_I) {
  form.KeyPreview = true;
  ShowActive();

  PressKey(WidgetOf(form), Qt::Key_I, QStringLiteral("\t"), Qt::ControlModifier, 'i');

  ASSERT_EQ(form.keys.size(), 1U);
  EXPECT_EQ(form.keys[0], std::make_pair(static_cast<int>('I'), static_cast<int>(kCtrl)));
}

TEST_F(Keyboard, Ctrl_and_the_same_key_in_the_Hebrew_layout_give_a_final_nun) {
  form.KeyPreview = true;
  ShowActive();

  // The toolkit reports the Latin key for Ctrl in any layout; the symbol tells what the layout has there.
  PressKey(WidgetOf(form), Qt::Key_I, QStringLiteral("\t"), Qt::ControlModifier, kFinalNunSymbol);

  ASSERT_EQ(form.keys.size(), 1U);
  EXPECT_EQ(form.keys[0], std::make_pair(kHebrewFinalNun, static_cast<int>(kCtrl)));
}

TEST_F(Keyboard, Codes_come_from_the_symbol_then_the_text_then_the_key) {
  const auto codeOf = [](int key, quint32 symbol, const QString& text) {
    return qt::KeyCodeOf(QKeyEvent(QEvent::KeyPress, key, Qt::NoModifier, 0, symbol, 0, text));
  };

  EXPECT_EQ(codeOf(Qt::Key_I, 'i', {}), 'I');
  EXPECT_EQ(codeOf(Qt::Key_I, 0x01000000 + 0x05DF, {}), kHebrewFinalNun);
  EXPECT_EQ(codeOf(Qt::Key_I, 0, QStringLiteral("ן")), kHebrewFinalNun);
  EXPECT_EQ(codeOf(Qt::Key_I, 0, {}), 'I');
  EXPECT_EQ(codeOf(Qt::Key_unknown, 0xCE0, {}), 0x05D0);
  EXPECT_EQ(codeOf(Qt::Key_unknown, 0xCFA, {}), 0x05EA);
  EXPECT_EQ(codeOf(Qt::Key_Escape, 0xFF1B, QStringLiteral("\x1b")), 27);
  EXPECT_EQ(codeOf(Qt::Key_F1, 0xFFBE, {}), 112);
  EXPECT_EQ(codeOf(Qt::Key_Shift, 0xFFE1, {}), 0);
}

TEST_F(Keyboard, The_shift_state_is_a_sum_of_the_held_keys) {
  form.KeyPreview = true;
  ShowActive();

  PressKey(WidgetOf(form), Qt::Key_A, QStringLiteral("A"), Qt::ShiftModifier);
  PressKey(WidgetOf(form), Qt::Key_A, {}, Qt::ShiftModifier | Qt::ControlModifier | Qt::AltModifier);

  ASSERT_EQ(form.keys.size(), 2U);
  EXPECT_EQ(form.keys[0].second, 1);
  EXPECT_EQ(form.keys[1].second, 7);
}

TEST_F(Keyboard, Ctrl_and_a_letter_over_a_table_belong_to_the_form) {
  ListView list(form, u"list");
  list.AddColumn({u"שם", 3000});
  list.Add(u"p1", u"alpha", 0);
  list.Add(u"p2", u"ink", 0);
  form.KeyPreview = true;
  ShowActive();
  WidgetOf(list).setFocus();

  PressKey(WidgetOf(list), Qt::Key_I, QStringLiteral("i"), Qt::ControlModifier, 'i');

  EXPECT_EQ(form.keys.size(), 1U);
  EXPECT_EQ(list.SelectedItem()->Key(), u"p1");
}

TEST_F(Keyboard, Escape_and_Enter_click_in_a_form_where_nothing_takes_the_focus) {
  PictureToCancel cancel(form);
  form.Default = form.Cancel;
  ShowActive();

  PressKey(WidgetOf(form), Qt::Key_Escape, QStringLiteral("\x1b"));
  PressKey(WidgetOf(form), Qt::Key_Return, QStringLiteral("\r"));
  PressKey(WidgetOf(form), Qt::Key_Enter, QStringLiteral("\r"));

  EXPECT_EQ(cancel.clicks, 3);
}

TEST_F(Keyboard, A_key_that_is_held_down_clicks_once) {
  PictureToCancel cancel(form);
  ShowActive();

  PressKey(WidgetOf(form), Qt::Key_Escape);
  QKeyEvent repeated(QEvent::KeyPress, Qt::Key_Escape, Qt::NoModifier, {}, true);
  QCoreApplication::sendEvent(&WidgetOf(form), &repeated);

  EXPECT_EQ(cancel.clicks, 1);
}

TEST_F(Keyboard, A_press_at_the_very_moment_of_the_release_is_the_held_key_again) {
  PictureToCancel cancel(form);
  ShowActive();

  SendEscape(QEvent::KeyPress, 1000);
  for (const quint64 moment : {1500, 1540, 1580}) {
    SendEscape(QEvent::KeyRelease, moment);
    SendEscape(QEvent::KeyPress, moment);
  }

  EXPECT_EQ(cancel.clicks, 1);
}

TEST_F(Keyboard, Two_presses_in_quick_succession_click_twice) {
  PictureToCancel cancel(form);
  ShowActive();

  SendEscape(QEvent::KeyPress, 1000);
  SendEscape(QEvent::KeyRelease, 1004);
  SendEscape(QEvent::KeyPress, 1005);

  EXPECT_EQ(cancel.clicks, 2);
}

TEST_F(Keyboard, A_held_key_goes_on_in_a_list) {
  ListView list(form, u"list");
  list.AddColumn({u"name", 1500});
  form.design = [&] { list.Move(0, 0, 6000, 4500); };
  ShowActive();
  for (const char16_t* key : {u"first", u"second", u"third"}) list.Add(key, key, 0);
  auto& view = As<QTreeView>(list);
  SendKey(view, QEvent::KeyPress, Qt::Key_Down, 1000);
  const int row = view.currentIndex().row();

  SendKey(view, QEvent::KeyRelease, Qt::Key_Down, 1500);
  SendKey(view, QEvent::KeyPress, Qt::Key_Down, 1500);

  EXPECT_EQ(view.currentIndex().row(), row + 1);
}

} // namespace quendra::forms::qt

#include "forms/qt/QtFixture.h"

#include <QAccessible>

namespace quendra::forms::qt {

/// Labels that act as buttons: what they look like, and when they can't be pressed.
class LabelButton : public QtFixture {
 protected:
  LabelButton() {
    form.design = [this] {
      form.BackColour = kWhite;
      button.Style = Label::Look::Button;
      button.Transparent = false;
      button.BackColour = kGreen;
      button.ForeColour = kWhite;
      button.Move(0, 0, 1500, 450);
      next.Move(0, 600, 1500, 450);
    };
    button.Click = [this] { ++clicks; };
    next.Click = [] {};
  }

  QColor Face() { return PixelOf(WidgetOf(button), 10, 5); }
  QAccessibleInterface& InterfaceOf(const Control& control) {
    return *QAccessible::queryAccessibleInterface(&WidgetOf(control));
  }
  /// Pixels of a part of the form for which a rule holds.
  template <typename Rule> int Count(const QRect& part, Rule rule) {
    const QImage image = WidgetOf(form).grab(part).toImage();
    int count = 0;
    for (int y = 0; y < image.height(); ++y)
      for (int x = 0; x < image.width(); ++x) count += rule(image.pixelColor(x, y));
    return count;
  }

  Label button{form, u"button"};
  Label next{form, u"next"};
  int clicks = 0;
};

TEST_F(LabelButton, Loses_its_own_colour_while_it_is_disabled) {
  ShowActive();
  EXPECT_EQ(Face(), QColor(0, 128, 0));

  button.Enabled = false;
  EXPECT_GT(Face().lightness(), 230);
  button.Enabled = true;

  EXPECT_EQ(Face(), QColor(0, 128, 0));
}

TEST_F(LabelButton, Takes_no_press_of_any_kind_while_it_is_disabled) {
  ShowActive();
  QWidget& widget = WidgetOf(button);
  widget.setFocus();
  button.Enabled = false;

  Click(widget);
  PressKey(widget, Qt::Key_Return, QStringLiteral("\r"));
  PressKey(widget, Qt::Key_Space, QStringLiteral(" "));
  InterfaceOf(button).actionInterface()->doAction(QAccessibleActionInterface::pressAction());

  EXPECT_EQ(clicks, 0);
}

TEST_F(LabelButton, In_a_disabled_container_takes_no_press_of_assistive_technology) {
  Frame frame(form, u"frame");
  Label inner(frame, u"inner");
  inner.Click = [this] { ++clicks; };
  ShowActive();
  frame.Enabled = false;

  As<qt::WidgetView>(inner).Press();

  EXPECT_EQ(clicks, 0);
}

TEST_F(LabelButton, Hands_the_focus_on_when_it_is_disabled) {
  ShowActive();
  WidgetOf(button).setFocus();

  button.Enabled = false;

  EXPECT_EQ(QApplication::focusWidget(), &WidgetOf(next));
}

TEST_F(LabelButton, Keeps_no_hand_cursor_when_it_is_disabled_under_the_mouse) {
  button.MouseMove = [this](int, int, int, int) { desktop.SetCursor(desktop.LoadCursor(32649)); };
  ShowActive();
  MoveMouse(WidgetOf(button), {5, 5});
  ASSERT_EQ(WidgetOf(button).cursor().shape(), Qt::PointingHandCursor);

  button.Enabled = false;

  EXPECT_EQ(WidgetOf(button).cursor().shape(), Qt::ArrowCursor);
}

TEST_F(LabelButton, For_the_mouse_alone_takes_clicks_and_is_no_stop_of_Tab_and_no_button) {
  Label row(form, u"row");
  int rowClicks = 0;
  row.Click = [&] { ++rowClicks; };
  row.MouseOnly = true;
  form.design = [&] { row.Move(0, 1500, 1500, 450); };
  ShowActive();

  Click(WidgetOf(row));

  EXPECT_EQ(rowClicks, 1);
  EXPECT_EQ(WidgetOf(row).focusPolicy(), Qt::NoFocus);
  EXPECT_EQ(InterfaceOf(row).role(), QAccessible::StaticText);
}

TEST_F(LabelButton, Without_a_handler_is_still_a_button_to_assistive_technology) {
  Label later(form, u"later");
  later.Style = Label::Look::Button;
  form.design = [&] { later.Enabled = false; };

  desktop.Show(form);

  EXPECT_EQ(InterfaceOf(later).role(), QAccessible::Button);
  EXPECT_TRUE(InterfaceOf(later).state().disabled);
}

/// A link that is no wider than its letters, as one that lies on a word of a sentence.
class LinkRing : public LabelButton {
 protected:
  LinkRing() {
    form.design = [this] {
      form.BackColour = kWhite;
      button.Style = Label::Look::Link;
      button.Transparent = true;
      button.ForeColour = kRed;
      button.Caption = Text(u"כאן");
      button.Move(1500, 1500, 300, 330);
    };
  }
  void ShowRing(bool shown) {
    WidgetOf(form).setAttribute(Qt::WA_KeyboardFocusChange, shown);
    WidgetOf(button).setFocus();
  }
  int InkIn(const QRect& part) {
    return Count(part, [](const QColor& pixel) { return pixel.red() > 200 && pixel.blue() < 200; });
  }
  int RingIn(const QRect& part) {
    return Count(part, [](const QColor& pixel) { return pixel.blue() > 150 && pixel.red() < 100; });
  }
  /// Where the label lies: 100 pixels from the right edge of the form.
  const QRect label{280, 100, 20, 22};
  const QRect letters = label.adjusted(4, 3, 0, -3);
  const QRect around = label.adjusted(-6, -6, 6, 6);
};

TEST_F(LinkRing, Lies_outside_of_the_letters) {
  ShowActive();
  ShowRing(false);
  const int ink = InkIn(around);
  ASSERT_GT(ink, 20);

  ShowRing(true);

  EXPECT_EQ(InkIn(around), ink);
  EXPECT_GT(RingIn(around), 60);
  EXPECT_EQ(RingIn(letters), 0);
}

TEST_F(LinkRing, Is_not_there_for_those_who_use_the_mouse) {
  ShowActive();

  ShowRing(false);

  EXPECT_EQ(RingIn(around), 0);
}

TEST_F(LinkRing, Has_its_room_also_when_a_label_becomes_a_link_later) {
  ShowActive();
  const QRect asLink = WidgetOf(button).geometry();

  button.Style = Label::Look::Plain;
  EXPECT_EQ(WidgetOf(button).geometry(), label);
  button.Style = Label::Look::Link;

  EXPECT_EQ(WidgetOf(button).geometry(), asLink);
}

} // namespace quendra::forms::qt

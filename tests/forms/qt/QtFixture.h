#pragma once

#include "forms/controls/ComboBox.h"
#include "forms/controls/Controls.h"
#include "forms/controls/ListView.h"
#include "forms/qt/QtDesktop.h"

#include <gtest/gtest.h>

#include <QImage>
#include <QWidget>

namespace quendra::forms::qt {

/// A form of 400 by 300 pixels, at 96 DPI 15 twips each, whose handlers are told by the test.
struct TestForm : Form {
  TestForm() : Form(u"frmTest") {}
  void Design() override {
    Move(0, 0, 6000, 4500);
    if (design) design();
  }
  void Form_Load() override {
    if (load) load();
  }
  void Form_Unload() override {
    if (unload) unload();
  }
  void Form_KeyDown(int keyCode, int shift) override { keys.push_back({keyCode, shift}); }
  void Form_Activate() override { ++activations; }

  std::function<void()> design;
  std::function<void()> load;
  std::function<void()> unload;
  std::vector<std::pair<int, int>> keys;
  int activations = 0;
};

/// Takes back that a program of an earlier test ended outside of its loop: the toolkit would let no loop of
/// its process run any more.
void ForgetEarlierEnds();

/// A desktop on a screen that nobody sees, and a form for it.
class QtFixture : public testing::Test {
 public:
  /// The widget that shows a control.
  static QWidget& WidgetOf(const Control& control);
  template <typename Kind> static Kind& As(const Control& control) {
    return dynamic_cast<Kind&>(*control.View());
  }

  static void MoveMouse(QWidget& widget, QPoint place, Qt::MouseButtons held = Qt::NoButton);
  static void PressMouse(QWidget& widget, QPoint place, Qt::MouseButton button = Qt::LeftButton,
                         Qt::KeyboardModifiers modifiers = {});
  static void ReleaseMouse(QWidget& widget, QPoint place, Qt::MouseButton button = Qt::LeftButton,
                           Qt::KeyboardModifiers modifiers = {});
  static void DoubleClickMouse(QWidget& widget, QPoint place);
  static void Click(QWidget& widget);
  static void PressKey(QWidget& widget, int key, const QString& text = {},
                       Qt::KeyboardModifiers modifiers = {}, quint32 symbol = 0);
  static QColor PixelOf(QWidget& widget, int x, int y);

 protected:
  QtFixture();
  ~QtFixture() override;

  /// Shows the form and makes its window the active one, as a window manager would.
  void ShowActive();
  /// Runs the loop until `done` says so, for five seconds at most; false when the time ran out.
  bool RunUntil(const std::function<bool()>& done);
  /// Answers the next message box by its button as soon as it is up, and keeps what it said.
  struct Box {
    QString title;
    QString text;
    QString button;
    Qt::LayoutDirection direction = Qt::LayoutDirectionAuto;
    int icon = -1;
    int count = 0;
  };
  void AnswerBox(Box& box);

  QtDesktop desktop;
  TestForm form;

 private:
  QObject answers_; ///< what waits for a box goes with the test
};

inline constexpr int kPixel = 15;

} // namespace quendra::forms::qt

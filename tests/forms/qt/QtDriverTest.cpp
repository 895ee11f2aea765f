#include "forms/qt/QtFixture.h"
#include "forms/suite/DesktopSuite.h"

#include "forms/view/FocusOrder.h"

#include <QMessageBox>
#include <QPointer>
#include <QPushButton>
#include <QTimer>

namespace quendra::forms::qt {
namespace {

struct Key {
  int code;
  Qt::Key key;
  char16_t text;
};

/// As the display server tells a key.
Key KeyOf(int code, int shift) {
  switch (code) {
  case kTabKey: return {code, shift & kShift ? Qt::Key_Backtab : Qt::Key_Tab, u'\t'};
  case kEnterKey: return {code, Qt::Key_Return, u'\r'};
  case kEscapeKey: return {code, Qt::Key_Escape, u'\x1b'};
  case kHomeKey: return {code, Qt::Key_Home, {}};
  case kEndKey: return {code, Qt::Key_End, {}};
  case kUpKey: return {code, Qt::Key_Up, {}};
  case kDownKey: return {code, Qt::Key_Down, {}};
  case kBackspaceKey: return {code, Qt::Key_Backspace, u'\b'};
  default: return {code, static_cast<Qt::Key>(code), static_cast<char16_t>(code)};
  }
}

Qt::KeyboardModifiers ModifiersOf(int shift) {
  Qt::KeyboardModifiers modifiers;
  if (shift & kShift) modifiers |= Qt::ShiftModifier;
  if (shift & kCtrl) modifiers |= Qt::ControlModifier;
  if (shift & kAlt) modifiers |= Qt::AltModifier;
  return modifiers;
}

BoxSign SignOf(QMessageBox::Icon icon) {
  switch (icon) {
  case QMessageBox::Critical: return BoxSign::Critical;
  case QMessageBox::Question: return BoxSign::Question;
  case QMessageBox::Warning: return BoxSign::Exclamation;
  case QMessageBox::Information: return BoxSign::Information;
  default: return BoxSign::None;
  }
}

/// The user of the toolkit's desktop, on a screen that nobody sees.
class QtDriver : public DesktopDriver {
 public:
  QtDriver() { ForgetEarlierEnds(); }

  Desktop& TheDesktop() override { return desktop_; }
  platform::EventLoop& Loop() override { return desktop_; }

  int Run(std::function<void()> start) override {
    bool inTime = true;
    QTimer limit;
    limit.setSingleShot(true);
    QObject::connect(&limit, &QTimer::timeout, &limit, [&] {
      inTime = false;
      QCoreApplication::exit();
    });
    limit.start(kMostMilliseconds);
    const int status = desktop_.Run(std::move(start));
    return inTime ? status : -1;
  }
  bool WaitUntil(const std::function<bool()>& condition) override {
    QTimer looks; // so that the condition is looked at when nothing else happens
    looks.start(1);
    QTimer limit;
    limit.setSingleShot(true);
    limit.start(kMostMilliseconds);
    while (!condition()) {
      if (!limit.isActive()) return false;
      QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    }
    return true;
  }

  void Click(Control& control) override {
    if (control.View()) QtFixture::Click(QtFixture::WidgetOf(control));
  }
  void PressKey(Form& form, int keyCode, int shift) override {
    QWidget& window = QtFixture::WidgetOf(form);
    if (!window.isActiveWindow()) QApplication::setActiveWindow(&window);
    QWidget* focused = window.focusWidget();
    const Key key = KeyOf(keyCode, shift);
    QtFixture::PressKey(focused ? *focused : window, key.key, key.text ? QString(QChar(key.text)) : QString(),
                        ModifiersOf(shift));
  }
  void PressCloseBox(Form& form) override { QtFixture::WidgetOf(form).close(); }
  void AnswerBox(SeenBox& seen, int button) override {
    QTimer::singleShot(1, &answers_, [this, &seen, button] {
      auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
      if (!box || !box->isVisible()) return AnswerBox(seen, button);
      Look(*box, seen);
      const auto number = static_cast<std::size_t>(
          std::find_if(seen.content.buttons.begin(), seen.content.buttons.end(),
                       [&](const BoxButton& shown) { return shown.number == button; }) -
          seen.content.buttons.begin());
      box->buttons().at(static_cast<qsizetype>(number))->click();
    });
  }

  bool Stands(Form& form) override { return form.View() && QtFixture::WidgetOf(form).isVisible(); }
  const Control* Focused(Form& form) override {
    const QWidget* focused = QtFixture::WidgetOf(form).focusWidget();
    const auto* view = dynamic_cast<const WidgetView*>(focused);
    const Control* control = view ? view->TheControl() : nullptr;
    return control == &form ? nullptr : control;
  }

 private:
  static constexpr int kMostMilliseconds = 5000;

  static void Look(const QMessageBox& box, SeenBox& seen) {
    seen.content = {};
    seen.content.title = ToText(box.windowTitle());
    seen.content.text = ToText(box.text());
    seen.content.sign = SignOf(box.icon());
    seen.content.rightToLeft = box.layoutDirection() == Qt::RightToLeft;
    for (const QAbstractButton* button : box.buttons())
      seen.content.buttons.push_back({button->property("number").toInt(), ToText(button->text())});
    ++seen.count;
  }

  QtDesktop desktop_{"forms_qt_test"};
  QObject answers_; ///< what waits for a box goes with the user
};

std::unique_ptr<DesktopDriver> MakeDriver() { return std::make_unique<QtDriver>(); }

} // namespace
} // namespace quendra::forms::qt

namespace quendra::forms {
INSTANTIATE_TEST_SUITE_P(Qt, DesktopSuite, testing::Values(&qt::MakeDriver));
} // namespace quendra::forms

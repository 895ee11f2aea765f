#include "forms/qt/QtFixture.h"

#include <QKeyEvent>
#include <QMessageBox>
#include <QMouseEvent>
#include <QPushButton>
#include <QTimer>

#include <memory>

namespace quendra::forms::qt {

namespace {

int argumentCount = 1;
char programName[] = "forms_qt_test";
char* arguments[] = {programName, nullptr};

/// One application object for all tests of the process: making another for each would take longer than the
/// tests.
class ApplicationOfAllTests : public testing::Environment {
 public:
  void SetUp() override {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    application_ = std::make_unique<QApplication>(argumentCount, arguments);
  }
  void TearDown() override { application_.reset(); }

 private:
  std::unique_ptr<QApplication> application_;
};

const testing::Environment* const environment = testing::AddGlobalTestEnvironment(new ApplicationOfAllTests);

void SendMouse(QWidget& widget, QEvent::Type type, QPoint place, Qt::MouseButton button,
               Qt::MouseButtons held, Qt::KeyboardModifiers modifiers = {}) {
  QMouseEvent event(type, place, widget.mapToGlobal(place), button, held, modifiers);
  QCoreApplication::sendEvent(&widget, &event);
}

} // namespace

void ForgetEarlierEnds() {
  QTimer::singleShot(0, qApp, &QCoreApplication::quit);
  QCoreApplication::exec();
}

QtFixture::QtFixture() : desktop(programName) { ForgetEarlierEnds(); }

QtFixture::~QtFixture() { form.unload = {}; }

void QtFixture::ShowActive() {
  desktop.Show(form);
  QApplication::setActiveWindow(&WidgetOf(form));
}

QWidget& QtFixture::WidgetOf(const Control& control) { return dynamic_cast<QWidget&>(*control.View()); }

void QtFixture::MoveMouse(QWidget& widget, QPoint place, Qt::MouseButtons held) {
  SendMouse(widget, QEvent::MouseMove, place, Qt::NoButton, held);
}

void QtFixture::PressMouse(QWidget& widget, QPoint place, Qt::MouseButton button,
                           Qt::KeyboardModifiers modifiers) {
  SendMouse(widget, QEvent::MouseButtonPress, place, button, button, modifiers);
}

void QtFixture::ReleaseMouse(QWidget& widget, QPoint place, Qt::MouseButton button,
                             Qt::KeyboardModifiers modifiers) {
  SendMouse(widget, QEvent::MouseButtonRelease, place, button, Qt::NoButton, modifiers);
}

void QtFixture::DoubleClickMouse(QWidget& widget, QPoint place) {
  SendMouse(widget, QEvent::MouseButtonDblClick, place, Qt::LeftButton, Qt::LeftButton);
}

void QtFixture::Click(QWidget& widget) {
  PressMouse(widget, {1, 1});
  ReleaseMouse(widget, {1, 1});
}

void QtFixture::PressKey(QWidget& widget, int key, const QString& text, Qt::KeyboardModifiers modifiers,
                         quint32 symbol) {
  QKeyEvent event(QEvent::KeyPress, key, modifiers, 0, symbol, 0, text);
  QCoreApplication::sendEvent(&widget, &event);
}

QColor QtFixture::PixelOf(QWidget& widget, int x, int y) { return widget.grab().toImage().pixelColor(x, y); }

bool QtFixture::RunUntil(const std::function<bool()>& done) {
  QTimer limit;
  limit.setSingleShot(true);
  limit.start(5000);
  while (!done() && limit.isActive()) QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
  return done();
}

void QtFixture::AnswerBox(Box& answered) {
  QTimer::singleShot(0, &answers_, [this, &answered] {
    auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
    if (!box) return AnswerBox(answered);
    QAbstractButton* button = box->buttons().constFirst();
    // Marks of direction are the box's own.
    const QString text = box->text().remove(QChar(0x200F));
    answered = {box->windowTitle(),     text,        button->text(),
                box->layoutDirection(), box->icon(), answered.count + 1};
    button->click();
  });
}

} // namespace quendra::forms::qt

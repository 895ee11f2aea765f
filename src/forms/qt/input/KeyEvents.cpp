#include "forms/qt/input/KeyEvents.h"

#include "forms/qt/input/MouseEvents.h"
#include "forms/qt/views/FormView.h"
#include "forms/view/Keyboard.h"

#include <QCoreApplication>
#include <QKeyEvent>
#include <QPointer>

#include <algorithm>
#include <iterator>

namespace quendra::forms::qt {

namespace {

struct NamedKey {
  int key;
  int code;
};

constexpr NamedKey kNamedKeys[] = {
    {Qt::Key_Backspace, 8}, {Qt::Key_Tab, 9},     {Qt::Key_Return, 13},   {Qt::Key_Enter, 13},
    {Qt::Key_Escape, 27},   {Qt::Key_PageUp, 33}, {Qt::Key_PageDown, 34}, {Qt::Key_End, 35},
    {Qt::Key_Home, 36},     {Qt::Key_Left, 37},   {Qt::Key_Up, 38},       {Qt::Key_Right, 39},
    {Qt::Key_Down, 40},     {Qt::Key_Insert, 45}, {Qt::Key_Delete, 46},
};

int CharacterCode(int code) { return code >= 'a' && code <= 'z' ? code - 'a' + 'A' : code; }

/// The character of an X key symbol, 0 for none. With Ctrl held the toolkit's own key code is that of the
/// Latin layout and the text is a control character, so the symbol alone tells the active layout.
int CharacterOfSymbol(quint32 symbol) {
  constexpr quint32 kFirstHebrew = 0xCE0;
  constexpr quint32 kLastHebrew = 0xCFA;
  constexpr quint32 kUnicode = 0x01000000;
  if (symbol >= kFirstHebrew && symbol <= kLastHebrew)
    return static_cast<int>(0x05D0 + symbol - kFirstHebrew);
  if (symbol > kUnicode && symbol <= kUnicode + 0xFFFF) return static_cast<int>(symbol - kUnicode);
  const bool isLatin = (symbol >= 0x20 && symbol < 0x7F) || (symbol >= 0xA0 && symbol <= 0xFF);
  return isLatin ? CharacterCode(static_cast<int>(symbol)) : 0;
}

void SendMarked(QWidget& widget, const QKeyEvent& key) {
  QKeyEvent marked(QEvent::KeyPress, key.key(), key.modifiers(), key.nativeScanCode(), key.nativeVirtualKey(),
                   key.nativeModifiers(), key.text(), true, static_cast<quint16>(key.count()));
  marked.setTimestamp(key.timestamp());
  QCoreApplication::sendEvent(&widget, &marked);
}

} // namespace

int KeyCodeOf(const QKeyEvent& event) {
  const auto* named = std::find_if(std::begin(kNamedKeys), std::end(kNamedKeys),
                                   [&](const NamedKey& row) { return row.key == event.key(); });
  if (named != std::end(kNamedKeys)) return named->code;
  if (event.key() >= Qt::Key_F1 && event.key() <= Qt::Key_F16) return 112 + event.key() - Qt::Key_F1;
  if (const int character = CharacterOfSymbol(event.nativeVirtualKey())) return character;
  const QString text = event.text();
  if (text.size() == 1 && text.at(0).isPrint()) return CharacterCode(text.at(0).unicode());
  return event.key() <= 0xFFFF ? CharacterCode(event.key()) : 0;
}

bool KeyEvents::eventFilter(QObject* watched, QEvent* event) {
  if (!watched->isWidgetType()) return false;
  if (event->type() == QEvent::KeyRelease) {
    const auto& released = static_cast<const QKeyEvent&>(*event);
    releasedKey_ = released.key();
    releasedAt_ = released.timestamp();
  }
  if (event->type() != QEvent::KeyPress) return false;
  auto* widget = static_cast<QWidget*>(watched);
  const auto& key = static_cast<const QKeyEvent&>(*event);
  if (IsUnmarkedRepeat(key)) {
    SendMarked(*widget, key);
    return true;
  }
  const QPointer<FormView> view = dynamic_cast<FormView*>(widget->window());
  if (!view) return false;
  // A key that a control doesn't want climbs through its containers; the form hears of it where it came in.
  const QWidget* focused = view->focusWidget();
  if (widget == (focused ? focused : view.data())) Preview(*view, *widget, key);
  return view && widget == view && Press(*view, key);
}

/// A held key comes from the display server as releases and presses of one moment. The toolkit marks those as
/// repeats only where it has read both when it looks at the release.
bool KeyEvents::IsUnmarkedRepeat(const QKeyEvent& press) const {
  return !press.isAutoRepeat() && press.timestamp() != 0 && press.timestamp() == releasedAt_ &&
         press.key() == releasedKey_;
}

void KeyEvents::Preview(FormView& view, const QWidget& widget, const QKeyEvent& key) {
  if (!view.TheForm() || (!view.TheForm()->KeyPreview && &widget != &view)) return;
  const int code = KeyCodeOf(key);
  const int shift = ShiftStateOf(key.modifiers());
  if (code != 0) dispatcher_.Dispatch([&] { view.TheForm()->Form_KeyDown(code, shift); });
}

bool KeyEvents::Press(FormView& view, const QKeyEvent& key) {
  // A key held down is one press: what it closes may lie on something else that it would close next.
  if (!view.TheForm() || key.isAutoRepeat()) return false;
  const Control* pressed = ControlPressedBy(*view.TheForm(), KeyCodeOf(key), ShiftStateOf(key.modifiers()));
  if (pressed) dispatcher_.Dispatch([&] { pressed->Click(); });
  return pressed;
}

} // namespace quendra::forms::qt

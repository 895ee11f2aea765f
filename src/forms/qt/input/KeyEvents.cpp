#include "forms/qt/input/KeyEvents.h"

#include "forms/qt/input/MouseEvents.h"
#include "forms/qt/views/FormView.h"

#include <QCoreApplication>
#include <QKeyEvent>
#include <QPointer>

#include <algorithm>
#include <iterator>

namespace quendra::forms::qt {

namespace {

struct CodeOfKey {
  int key;
  NamedKey code;
};

constexpr CodeOfKey kNamedKeys[] = {
    {Qt::Key_Backspace, kBackspaceKey}, {Qt::Key_Tab, kTabKey},       {Qt::Key_Return, kEnterKey},
    {Qt::Key_Enter, kEnterKey},         {Qt::Key_Escape, kEscapeKey}, {Qt::Key_PageUp, kPageUpKey},
    {Qt::Key_PageDown, kPageDownKey},   {Qt::Key_End, kEndKey},       {Qt::Key_Home, kHomeKey},
    {Qt::Key_Left, kLeftKey},           {Qt::Key_Up, kUpKey},         {Qt::Key_Right, kRightKey},
    {Qt::Key_Down, kDownKey},           {Qt::Key_Insert, kInsertKey}, {Qt::Key_Delete, kDeleteKey},
};

/// The character of an X key symbol, 0 for none. With Ctrl held the toolkit's own key code is that of the
/// Latin layout and the text is a control character, so the symbol alone tells the active layout.
char16_t CharacterOfSymbol(quint32 symbol) {
  constexpr quint32 kFirstHebrew = 0xCE0;
  constexpr quint32 kLastHebrew = 0xCFA;
  constexpr quint32 kUnicode = 0x01000000;
  if (symbol >= kFirstHebrew && symbol <= kLastHebrew)
    return static_cast<char16_t>(0x05D0 + symbol - kFirstHebrew);
  if (symbol > kUnicode && symbol <= kUnicode + 0xFFFF) return static_cast<char16_t>(symbol - kUnicode);
  const bool isLatin = (symbol >= 0x20 && symbol < 0x7F) || (symbol >= 0xA0 && symbol <= 0xFF);
  return isLatin ? static_cast<char16_t>(symbol) : u'\0';
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
                                   [&](const CodeOfKey& row) { return row.key == event.key(); });
  if (named != std::end(kNamedKeys)) return named->code;
  if (event.key() >= Qt::Key_F1 && event.key() <= Qt::Key_F16) return kF1Key + event.key() - Qt::Key_F1;
  if (const char16_t character = CharacterOfSymbol(event.nativeVirtualKey()))
    return CodeOfCharacter(character);
  const QString text = event.text();
  if (text.size() == 1 && text.at(0).isPrint()) return CodeOfCharacter(text.at(0).unicode());
  return event.key() <= 0xFFFF ? CodeOfCharacter(static_cast<char16_t>(event.key())) : 0;
}

KeyPress PressOf(const QKeyEvent& event) {
  return {KeyCodeOf(event), ShiftStateOf(event.modifiers()), event.isAutoRepeat()};
}

bool KeyEvents::eventFilter(QObject* watched, QEvent* event) {
  if (!watched->isWidgetType()) return false;
  if (event->type() == QEvent::KeyRelease) {
    const auto& released = static_cast<const QKeyEvent&>(*event);
    held_.Released(released.key(), released.timestamp());
  }
  if (event->type() != QEvent::KeyPress) return false;
  auto* widget = static_cast<QWidget*>(watched);
  const auto& key = static_cast<const QKeyEvent&>(*event);
  // The toolkit marks these as repeats only where it has read both when it looks at the release.
  if (!key.isAutoRepeat() && held_.IsRepeatedBy(key.key(), key.timestamp())) {
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

void KeyEvents::Preview(FormView& view, const QWidget& widget, const QKeyEvent& event) {
  const KeyPress key = PressOf(event);
  if (!view.TheForm() || !HearsOf(*view.TheForm(), key, &widget != &view)) return;
  dispatcher_.Dispatch([&] { view.TheForm()->Form_KeyDown(key.code, key.shift); });
}

bool KeyEvents::Press(FormView& view, const QKeyEvent& event) {
  const Control* pressed = view.TheForm() ? ControlPressedBy(*view.TheForm(), PressOf(event)) : nullptr;
  if (pressed) dispatcher_.Dispatch([&] { pressed->Click(); });
  return pressed;
}

} // namespace quendra::forms::qt

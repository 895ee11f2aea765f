#pragma once

#include "forms/loop/Dispatcher.h"
#include "forms/view/fields/Typing.h"

#include <QString>

class QFocusEvent;
class QKeyEvent;

namespace quendra::forms::qt {

/// What keys and the focus do in a field, whatever widget of the toolkit shows it.
class EntryKeys {
 public:
  /// How the widget is edited.
  struct Editing {
    bool ofManyLines = false;
    std::function<void(const QString&)> insert;
    std::function<void()> deleteBack;
  };
  EntryKeys(Dispatcher& dispatcher, const Control& control, TextEntry& entry, Editing editing)
      : dispatcher_(dispatcher), control_(&control), entry_(&entry), editing_(std::move(editing)) {}

  /// nullptr once released.
  TextEntry* Entry() const { return entry_; }
  void Release() { entry_ = nullptr; }

  /// False for a key that the widget handles itself.
  bool Press(QKeyEvent& event);
  /// What comes of the text that an input method has made of several keys.
  QString Commit(const QString& text);
  /// The focus has come; it is told where it didn't only come back with the window.
  void FocusCame(const QFocusEvent& event);
  void FocusWent(const QFocusEvent& event);
  /// The user has edited the text.
  void Edited(const QString& shown, int caret);
  void Selected(int start, int length);

 private:
  Typing TypeOne(int character);
  void Apply(const Typing& typing);

  Dispatcher& dispatcher_;
  const Control* control_;
  TextEntry* entry_;
  Editing editing_;
  bool wentWithWindow_ = false;
};

} // namespace quendra::forms::qt

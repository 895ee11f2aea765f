#pragma once

#include "forms/win32/views/ViewFixture.h"

namespace quendra::forms::win32 {

/// Fields for text as the system's windows show them.
class FieldWindows : public ViewFixture {
 protected:
  FieldWindows() {
    form.design = [this] {
      label.Caption = u"כתובת מעקב:";
      label.Move(0, 0, 1500, 300);
      line.Move(150, 300, 3000, 450);
      lines.Move(150, 900, 5000, 1500);
      combo.Move(150, 2700, 3000, 450);
    };
    lines.MultiLine = true;
    lines.VerticalScrollBar = true;
    lines.Monospaced = true;
    combo.FreeText = true;
    combo.AddItem(u"www.one.test");
    combo.AddItem(u"www.two.test");
  }
  static Text Shown(const Control& control) { return TextOfWindow(Inner(control)); }
  static DWORD Style(const Control& control, int index = GWL_STYLE) {
    return static_cast<DWORD>(::GetWindowLongW(Inner(control), index));
  }
  static HWND WindowWithCaret() {
    GUITHREADINFO thread{};
    thread.cbSize = sizeof thread;
    ::GetGUIThreadInfo(::GetCurrentThreadId(), &thread);
    return thread.hwndCaret;
  }
  HWND Edit() { return ::FindWindowExW(Inner(combo), nullptr, L"EDIT", nullptr); }

  Label label{form, u"Label2"};
  TextBox line{form, u"line"};
  TextBox lines{form, u"lines"};
  ComboBox combo{form, u"combo"};
};

} // namespace quendra::forms::win32

#pragma once

#include "forms/controls/ListBox.h"
#include "forms/win32/views/FieldView.h"

namespace quendra::forms::win32 {

class ListBoxView : public FieldView {
 public:
  ListBoxView(ViewContext& context, ListBox& list, HWND parent);
  KeyUse Use(const KeyPress& key) override;
  Text TipAt(HWND window, Spot place) const override;

 protected:
  std::optional<LRESULT> Answer(UINT message, WPARAM wParam, LPARAM lParam) override;
  std::optional<LRESULT> AnswerInner(UINT message, WPARAM wParam, LPARAM lParam) override;
  void Notified(int code) override;
  Area Room(Extent field) const override;
  void Apply(Aspect aspect) override;

 private:
  ListBox& List() const { return static_cast<ListBox&>(*TheControl()); }
  void FillItems() const;
  void ShowSelection() const;
  int RowHeight() const;
  /// The mouse has chosen what the window shows as chosen now.
  LRESULT PassMouse(UINT message, WPARAM wParam, LPARAM lParam);

  bool byMouse_ = false;
};

} // namespace quendra::forms::win32

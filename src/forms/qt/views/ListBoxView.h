#pragma once

#include "forms/controls/ListBox.h"
#include "forms/qt/views/WidgetView.h"

#include <QListWidget>

namespace quendra::forms::qt {

class ListBoxView : public QListWidget, public WidgetView {
 public:
  ListBoxView(ViewContext& context, ListBox& list, QWidget* parent);
  bool TakesMouse() const override { return false; }

 protected:
  void Apply(Aspect aspect) override;
  bool event(QEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;
  void focusInEvent(QFocusEvent* event) override;
  void focusOutEvent(QFocusEvent* event) override;
  void currentChanged(const QModelIndex& current, const QModelIndex& previous) override;
  QItemSelectionModel::SelectionFlags selectionCommand(const QModelIndex& index,
                                                       const QEvent* event) const override;

 private:
  ListBox& List() const { return static_cast<ListBox&>(*TheControl()); }
  void FillItems();
  void ShowSelection();

  bool showing_ = false; ///< what changes now is what the list box says, not the user
  bool byKeys_ = false;
};

} // namespace quendra::forms::qt

#pragma once

#include "forms/qt/WidgetView.h"

#include <memory>

class QEventLoop;

namespace quendra::forms::qt {

/// The window of a form, with the views of all its controls.
class FormView : public QWidget, public WidgetView {
 public:
  FormView(ViewContext& context, Form& form, WindowHandle handle);
  ~FormView() override;

  void Release() override;
  void ControlGone() override;
  QAccessible::Role Role() const override { return QAccessible::Window; }

  Form* TheForm() const { return static_cast<Form*>(TheControl()); }
  WindowHandle Handle() const { return handle_; }
  /// Shows the window in the middle of its owner or of the screen, once; a window that was moved stays where
  /// it is.
  void ShowOver(const QWidget* owner);
  /// Returns when the form is hidden or released, or the program ends.
  void RunModal(QWidget* owner);

 protected:
  void Apply(Aspect aspect) override;
  void Place() override;
  void Show() override;
  QString AccessibleName() const override;
  void paintEvent(QPaintEvent* event) override;
  void changeEvent(QEvent* event) override;
  void closeEvent(QCloseEvent* event) override;

 private:
  void AddViews(const Container& container, QWidget& parent);
  void OrderTabs() const;
  void FocusFirst();

  WindowHandle handle_;
  std::vector<View*> views_;
  std::vector<std::unique_ptr<View>> ownedViews_;
  QEventLoop* modalLoop_ = nullptr;
  bool wasPlaced_ = false;
  bool hadFocus_ = false;
};

} // namespace quendra::forms::qt

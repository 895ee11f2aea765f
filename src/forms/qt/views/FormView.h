#pragma once

#include "forms/qt/drawing/Shapes.h"
#include "forms/qt/views/WidgetView.h"
#include "forms/view/FormPlacement.h"

#include <QScrollArea>

#include <memory>
#include <optional>

class QEventLoop;

namespace quendra::forms::qt {

/// What the views of one form share: the desktop's own, save the scale, which fits the form to its screen. A
/// base of the form's view, so that it is there before the others.
class FormContext {
 protected:
  explicit FormContext(const ViewContext& desktops)
      : scale_(desktops.scale), shared_{desktops.desktop,  desktops.dispatcher, scale_,
                                        desktops.pictures, desktops.mouse,      desktops.startTimer,
                                        desktops.active} {}

  Scale scale_;
  ViewContext shared_;
};

/// The window of a form, with the views of all its controls. A screen that has too little room shows the
/// whole form smaller, and one that has far too little a part of it, to be scrolled.
class FormView : private FormContext, public QScrollArea, public WidgetView {
 public:
  FormView(ViewContext& context, Form& form, WindowHandle handle);
  ~FormView() override;

  void Release() override;
  void ControlGone() override;
  QWidget& Body() const override { return *page_; }

  Form* TheForm() const { return static_cast<Form*>(TheControl()); }
  WindowHandle Handle() const { return handle_; }
  /// Keeps a window that something belongs to: it is not destroyed meanwhile, only released.
  class Hold {
   public:
    explicit Hold(FormView* view) : view_(view) {
      if (view_) ++view_->holds_;
    }
    ~Hold() {
      if (view_ && --view_->holds_ == 0 && view_->isBuried_) view_->deleteLater();
    }
    Hold(const Hold&) = delete;
    Hold& operator=(const Hold&) = delete;

   private:
    FormView* view_;
  };
  /// Destroys the window, not before whatever runs now has returned and nothing holds it any more.
  void Bury();
  /// Shows the window in the middle of its owner or of the screen, once; a window that was moved stays where
  /// it is.
  void ShowOver(const QWidget* owner);
  /// Over or under other windows, or in or out of the band above all others.
  void PutAfter(InsertAfter place);
  /// Cuts the window to a shape, in the pixels of the form as it was laid out; none takes the shape away.
  void Shape(std::optional<RoundRect> shape);
  /// Returns when the form is hidden or released, or the program ends.
  void RunModal(QWidget* owner);

 protected:
  void Apply(Aspect aspect) override;
  void Place() override;
  void Show() override;
  void paintEvent(QPaintEvent* event) override;
  void changeEvent(QEvent* event) override;
  void moveEvent(QMoveEvent* event) override;
  void closeEvent(QCloseEvent* event) override;
  bool focusNextPrevChild(bool next) override;

 private:
  void AddViews(const Container& container, QWidget& parent);
  static QWidget* WidgetOf(const Control* control);
  void FocusFirst();
  const Control* ControlWithFocus() const;
  void Zoom(double factor);
  void CutOut();
  QMargins Frame() const;
  /// What the screen leaves for the inside of a window.
  Extent Room() const;
  void SettleFrame();
  void CentreOver(const QRect& over);
  void ComeOnScreen();

  WindowHandle handle_;
  QWidget* page_; ///< holds the controls' widgets
  std::optional<RoundRect> shape_;
  bool frameIsKnown_ = false;
  std::vector<View*> views_;
  std::vector<std::unique_ptr<View>> ownedViews_;
  QEventLoop* modalLoop_ = nullptr;
  bool wasPlaced_ = false;
  bool hadFocus_ = false;
  int holds_ = 0;
  bool isBuried_ = false;
};

} // namespace quendra::forms::qt

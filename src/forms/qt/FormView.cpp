#include "forms/qt/FormView.h"

#include "forms/Keyboard.h"
#include "forms/qt/FrameView.h"
#include "forms/qt/ViewFactory.h"

#include <QCloseEvent>
#include <QEventLoop>
#include <QGuiApplication>
#include <QPaintEvent>
#include <QPainter>
#include <QPointer>
#include <QScreen>
#include <QWindow>

#include <utility>

namespace quendra::forms::qt {

namespace {

Qt::WindowFlags WindowFlagsOf(const Form& form) {
  if (form.Border == BorderStyle::None) return Qt::Window | Qt::FramelessWindowHint;
  Qt::WindowFlags flags = Qt::Window | Qt::CustomizeWindowHint | Qt::WindowTitleHint |
                          Qt::WindowSystemMenuHint | Qt::WindowCloseButtonHint;
  if (form.Border == BorderStyle::FixedDialog) return flags;
  if (form.MinimizeBox) flags |= Qt::WindowMinimizeButtonHint;
  if (form.MaximizeBox) flags |= Qt::WindowMaximizeButtonHint;
  return flags;
}

} // namespace

FormView::FormView(ViewContext& context, Form& form, WindowHandle handle)
    : QWidget(nullptr, WindowFlagsOf(form)), WidgetView(context, form, *this), handle_(handle) {
  setLayoutDirection(form.RightToLeft ? Qt::RightToLeft : Qt::LeftToRight);
  setAttribute(Qt::WA_OpaquePaintEvent);
  AddViews(form, *this);
  OrderTabs();
}

FormView::~FormView() = default;

void FormView::AddViews(const Container& container, QWidget& parent) {
  for (Control* child : container.Children()) {
    const MadeView made = MakeView(Context(), *child, parent);
    if (!made.view) continue;
    views_.push_back(made.view);
    if (!made.widget) ownedViews_.emplace_back(made.view);
    child->Attach(made.view);
    if (const auto* inner = dynamic_cast<const Container*>(child)) AddViews(*inner, *made.widget);
  }
}

void FormView::OrderTabs() const {
  QWidget* before = nullptr;
  for (const Control* control : TabOrder(*TheForm())) {
    auto* view = dynamic_cast<WidgetView*>(control->View());
    if (!view) continue;
    if (before) setTabOrder(before, &view->Widget());
    before = &view->Widget();
  }
}

void FormView::Release() {
  if (!TheControl()) return;
  for (View* view : views_) view->Release();
  WidgetView::Release();
}

void FormView::ControlGone() {
  WidgetView::ControlGone();
  if (modalLoop_) modalLoop_->quit();
  hide();
}

void FormView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Caption)) setWindowTitle(VisibleText(TheForm()->Caption()));
  if (aspect == Aspect::Geometry) PlaceChildren(*TheForm());
}

void FormView::Place() {
  const Geometry place = TheForm()->Position();
  const QSize size(Context().scale.PixelsX(place.width), Context().scale.PixelsY(place.height));
  if (TheForm()->Border == BorderStyle::Sizable)
    resize(size);
  else
    setFixedSize(size);
}

// Showing is the desktop's, which knows how and over what; hiding is the form's own.
void FormView::Show() {
  if (TheForm()->Visible()) return;
  hide();
  if (modalLoop_) modalLoop_->quit();
}

QString FormView::AccessibleName() const { return VisibleText(TheForm()->Caption()); }

void FormView::ShowOver(const QWidget* owner) {
  if (!std::exchange(wasPlaced_, true)) {
    const QRect around =
        owner ? owner->frameGeometry() : QGuiApplication::primaryScreen()->availableGeometry();
    move(around.center() - rect().center());
  }
  show();
  raise();
  activateWindow();
  if (!std::exchange(hadFocus_, true)) FocusFirst();
}

// The toolkit's order is a ring, which says nothing of where it is entered.
void FormView::FocusFirst() {
  const Control* first = TheForm() ? FirstFocus(*TheForm()) : nullptr;
  if (auto* view = first ? dynamic_cast<WidgetView*>(first->View()) : nullptr)
    view->Widget().setFocus(Qt::ActiveWindowFocusReason);
}

void FormView::RunModal(QWidget* owner) {
  setWindowModality(Qt::ApplicationModal);
  QEventLoop loop;
  modalLoop_ = &loop;
  ShowOver(owner);
  if (owner && windowHandle()) windowHandle()->setTransientParent(owner->windowHandle());
  const QPointer<FormView> self(this);
  // Coming up may have run a handler that was done with the form at once.
  if (TheForm() && TheForm()->Visible() && !Context().dispatcher.Ended()) loop.exec();
  if (!self) return;
  modalLoop_ = nullptr;
  setWindowModality(Qt::NonModal);
}

// Painted, not set as the window's palette, which the lists and their scroll bars would take over.
void FormView::paintEvent(QPaintEvent* event) {
  QPainter painter(this);
  if (TheForm()) painter.fillRect(event->rect(), ToQColor(TheForm()->BackColour()));
}

void FormView::changeEvent(QEvent* event) {
  QWidget::changeEvent(event);
  if (event->type() != QEvent::ActivationChange || !TheForm()) return;
  Context().dispatcher.Dispatch([this] {
    if (isActiveWindow())
      TheForm()->Form_Activate();
    else
      TheForm()->Form_Deactivate();
  });
}

void FormView::closeEvent(QCloseEvent* event) {
  event->ignore();
  Context().dispatcher.Dispatch([this] {
    if (TheForm()) Context().desktop.Unload(*TheForm());
  });
}

} // namespace quendra::forms::qt

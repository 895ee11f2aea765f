#include "forms/qt/views/FormView.h"

#include "forms/qt/views/FrameView.h"
#include "forms/qt/views/ViewFactory.h"
#include "forms/view/FocusOrder.h"

#include <QCloseEvent>
#include <QEventLoop>
#include <QGuiApplication>
#include <QPaintEvent>
#include <QPainter>
#include <QPointer>
#include <QScreen>
#include <QScrollBar>
#include <QWindow>

#include <utility>

namespace quendra::forms::qt {

namespace {

/// What a window manager puts round a window, until it has told so itself; rather too much than too little.
constexpr QMargins kLikelyFrame{4, 36, 4, 4};

QRect UsableScreen(const QWidget& window) { return window.screen()->availableGeometry(); }

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
    : FormContext(context), WidgetView(shared_, form, *this), handle_(handle), page_(new QWidget) {
  setWindowFlags(WindowFlagsOf(form));
  setLayoutDirection(ToQt(ReadingDirection()));
  setFrameShape(QFrame::NoFrame);
  setFocusPolicy(Qt::NoFocus);
  viewport()->setAttribute(Qt::WA_OpaquePaintEvent);
  viewport()->setMouseTracking(true);
  page_->setMouseTracking(true);
  setWidget(page_);
  page_->setAutoFillBackground(false);
  AddViews(form, *page_);
  connect(screen(), &QScreen::availableGeometryChanged, this, [this] {
    if (!TheForm()) return;
    Place();
    ComeOnScreen();
  });
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

void FormView::Release() {
  if (!TheControl()) return;
  Context().active.Forget(*TheForm());
  for (View* view : views_) view->Release();
  WidgetView::Release();
}

void FormView::Bury() {
  isBuried_ = true;
  if (holds_ == 0) deleteLater();
}

void FormView::ControlGone() {
  Context().active.Forget(*TheControl());
  WidgetView::ControlGone();
  if (modalLoop_) modalLoop_->quit();
  hide();
}

void FormView::Apply(Aspect aspect) {
  if (Concerns(aspect, Aspect::Caption)) setWindowTitle(ShownText(TheForm()->Caption()));
  if (aspect == Aspect::Geometry) {
    PlaceChildren(*TheForm());
    if (isVisible()) ComeOnScreen();
  }
  viewport()->update();
}

void FormView::Place() {
  const Geometry place = TheForm()->Position();
  const Scale laidOut = scale_.Unzoomed();
  const Extent room = Room();
  const Fitting fitting = FittingScale({laidOut.PixelsX(place.width), laidOut.PixelsY(place.height)}, room);
  Zoom(fitting.scale);
  page_->resize(scale_.PixelsX(place.width), scale_.PixelsY(place.height));
  const Qt::ScrollBarPolicy bars = fitting.scrolls ? Qt::ScrollBarAsNeeded : Qt::ScrollBarAlwaysOff;
  setHorizontalScrollBarPolicy(bars);
  setVerticalScrollBarPolicy(bars);
  const Extent inside = WindowExtent(ToExtent(page_->size()), room, verticalScrollBar()->sizeHint().width());
  if (TheForm()->Border == BorderStyle::Sizable)
    resize(inside.width, inside.height);
  else
    setFixedSize(inside.width, inside.height);
}

void FormView::Zoom(double factor) {
  if (factor == scale_.zoom) return;
  scale_ = scale_.Unzoomed().Zoomed(factor);
  for (View* view : views_) {
    view->Changed(Aspect::Font);
    view->Changed(Aspect::Geometry);
  }
  CutOut();
}

void FormView::Shape(std::optional<RoundRect> shape) {
  shape_ = shape;
  CutOut();
}

void FormView::CutOut() {
  if (shape_)
    setMask(RegionOf(shape_->In(scale_)));
  else
    clearMask();
}

void FormView::PutAfter(InsertAfter place) {
  switch (place) {
  case InsertAfter::Top: return raise();
  case InsertAfter::Bottom: return lower();
  case InsertAfter::Topmost:
  case InsertAfter::NotTopmost: break;
  }
  const bool topmost = place == InsertAfter::Topmost;
  // By both: the toolkit's own road hides a window whose flags change.
  overrideWindowFlags(windowFlags().setFlag(Qt::WindowStaysOnTopHint, topmost));
  if (windowHandle()) windowHandle()->setFlag(Qt::WindowStaysOnTopHint, topmost);
}

QMargins FormView::Frame() const {
  if (windowFlags() & Qt::FramelessWindowHint) return {};
  const QMargins known = windowHandle() ? windowHandle()->frameMargins() : QMargins();
  return known.isNull() ? kLikelyFrame : known;
}

Extent FormView::Room() const { return ToExtent(UsableScreen(*this).marginsRemoved(Frame()).size()); }

// The window manager tells its frame once the window is up.
void FormView::SettleFrame() {
  if (frameIsKnown_ || !TheForm() || !windowHandle() || windowHandle()->frameMargins().isNull()) return;
  frameIsKnown_ = true;
  const QSize before = size();
  Place();
  if (size() == before) return ComeOnScreen();
  CentreOver(UsableScreen(*this));
}

void FormView::CentreOver(const QRect& over) {
  const Spot corner =
      CornerOver(ToExtent(size().grownBy(Frame())), ToArea(over), ToArea(UsableScreen(*this)));
  move(corner.left, corner.top);
}

void FormView::ComeOnScreen() {
  const QRect window = geometry().marginsAdded(Frame());
  const Spot corner = CornerOnScreen(ToArea(window), ToArea(UsableScreen(*this)));
  const QPoint there = ToQPoint(corner);
  if (there != window.topLeft()) move(there);
}

// Showing is the desktop's, which knows how and over what; hiding is the form's own.
void FormView::Show() {
  if (TheForm()->Visible()) return;
  hide();
  if (modalLoop_) modalLoop_->quit();
}

void FormView::ShowOver(const QWidget* owner) {
  if (!std::exchange(wasPlaced_, true)) {
    if (owner) setScreen(owner->screen());
    Place();
    CentreOver(owner ? owner->frameGeometry() : UsableScreen(*this));
  }
  show();
  raise();
  activateWindow();
  if (std::exchange(hadFocus_, true)) return;
  FocusFirst();
  // Who opens a form by the keyboard sees the ring at its first stop, too.
  setAttribute(Qt::WA_KeyboardFocusChange, owner && owner->testAttribute(Qt::WA_KeyboardFocusChange));
}

QWidget* FormView::WidgetOf(const Control* control) {
  auto* view = control ? dynamic_cast<WidgetView*>(control->View()) : nullptr;
  return view ? &view->Widget() : nullptr;
}

void FormView::FocusFirst() {
  if (QWidget* first = TheForm() ? WidgetOf(FirstFocus(*TheForm())) : nullptr)
    first->setFocus(Qt::ActiveWindowFocusReason);
}

const Control* FormView::ControlWithFocus() const {
  for (QWidget* widget = focusWidget(); widget && widget != this; widget = widget->parentWidget())
    if (const auto* view = dynamic_cast<WidgetView*>(widget)) return view->TheControl();
  return nullptr;
}

// Not by the toolkit's own ring of widgets, which also holds those that a panel lies over.
bool FormView::focusNextPrevChild(bool next) {
  if (!TheForm()) return QScrollArea::focusNextPrevChild(next);
  const TabDirection direction = next ? TabDirection::Forwards : TabDirection::Backwards;
  QWidget* const widget = WidgetOf(NextFocus(*TheForm(), ControlWithFocus(), direction));
  if (!widget) return false;
  widget->setFocus(next ? Qt::TabFocusReason : Qt::BacktabFocusReason);
  ensureWidgetVisible(widget);
  return true;
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
  QPainter painter(viewport());
  if (TheForm()) painter.fillRect(event->rect(), ToQColor(TheForm()->BackColour()));
}

void FormView::changeEvent(QEvent* event) {
  QScrollArea::changeEvent(event);
  SettleFrame();
  if (event->type() != QEvent::ActivationChange || !TheForm()) return;
  Context().dispatcher.Dispatch([this] {
    if (isActiveWindow())
      Context().active.Activate(*TheForm());
    else
      Context().active.Deactivate(*TheForm());
  });
}

void FormView::moveEvent(QMoveEvent* event) {
  QScrollArea::moveEvent(event);
  SettleFrame();
}

void FormView::closeEvent(QCloseEvent* event) {
  event->ignore();
  Context().dispatcher.Dispatch([this] {
    if (TheForm()) Context().desktop.Unload(*TheForm());
  });
}

} // namespace quendra::forms::qt

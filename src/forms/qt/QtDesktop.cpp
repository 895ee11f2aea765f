#include "forms/qt/QtDesktop.h"

#include "forms/qt/boxes/Boxes.h"
#include "forms/qt/drawing/Dress.h"

#include <QImageReader>
#include <QScreen>

namespace quendra::forms::qt {

namespace {

constexpr Qt::CursorShape kNoShape = Qt::BlankCursor;

Qt::CursorShape ShapeOf(int cursor) {
  switch (cursor) {
  case 32512: return Qt::ArrowCursor;
  case 32513: return Qt::IBeamCursor;
  case 32514: return Qt::WaitCursor;
  case 32649: return Qt::PointingHandCursor;
  default: return kNoShape;
  }
}

std::unique_ptr<QApplication> MakeApplication(int& argc, char** argv) {
  if (QCoreApplication::instance()) return nullptr;
  return std::make_unique<QApplication>(argc, argv);
}

} // namespace

QtDesktop::QtDesktop(std::string programName)
    : programName_(std::move(programName)), arguments_{programName_.data(), nullptr},
      application_(MakeApplication(argumentCount_, arguments_.data())),
      dispatcher_([](const Text& text) { ShowBox(FrontWindow(), text, kCritical, u"Quendra"); },
                  QCoreApplication::exit),
      mouse_(dispatcher_), keys_(dispatcher_),
      startTimer_([this](int milliseconds, auto tick) { return StartTimer(milliseconds, std::move(tick)); }),
      context_{*this, dispatcher_, scale_, pictures_, mouse_, startTimer_, active_}, drawing_(scale_),
      loop_(dispatcher_) {
  DressApplication(*qApp);
  InstallAccessibility();
  const QScreen* screen = QGuiApplication::primaryScreen();
  scale_ = {1440 / screen->logicalDotsPerInchX(), 1440 / screen->logicalDotsPerInchY()};
  constexpr int kMostImageMegabytes = 32;
  QImageReader::setAllocationLimit(kMostImageMegabytes);
  QApplication::setWindowIcon(QIcon(pictures_.PixmapOf(Picture::Artwork("quendra"))));
  qApp->installEventFilter(&keys_);
}

QtDesktop::~QtDesktop() {
  for (const auto& [handle, view] : windows_) delete view;
  QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

int QtDesktop::Run(std::function<void()> start) {
  if (start) Post(std::move(start));
  if (!dispatcher_.Ended()) QApplication::exec();
  while (!windows_.empty()) Close(*windows_.begin()->second);
  return dispatcher_.Status();
}

QWidget* QtDesktop::FrontWindow() {
  if (QWidget* active = QApplication::activeWindow()) return active;
  if (QWidget* modal = QApplication::activeModalWidget()) return modal;
  // Without a window manager no window is the active one.
  for (QWidget* window : QApplication::topLevelWidgets())
    if (window->isVisible() && dynamic_cast<FormView*>(window)) return window;
  return nullptr;
}

int QtDesktop::MessageBox(const Text& text, int flags, const Text& title) {
  const Standing box(*this);
  const int answer = ShowBox(FrontWindow(), text, flags, title);
  dispatcher_.UnwindIfEnded();
  return answer;
}

CursorHandle QtDesktop::LoadCursor(int id) {
  return ShapeOf(id) == kNoShape ? kNoCursor : CursorHandle(static_cast<std::uint32_t>(id));
}

void QtDesktop::SetCursor(CursorHandle cursor) {
  const Qt::CursorShape shape = ShapeOf(static_cast<int>(cursor.Value()));
  if (shape != kNoShape) mouse_.SetCursor(shape);
}

WindowHandle QtDesktop::HandleOf(Form& form) {
  const FormView* view = ViewOf(form);
  return view ? view->Handle() : kNoWindow;
}

FormView* QtDesktop::ViewOf(WindowHandle window) const {
  const auto found = windows_.find(window);
  return found == windows_.end() ? nullptr : found->second;
}

std::int32_t QtDesktop::SendMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                                    std::uint32_t lParam) {
  return Windows.Dispatch(window, message, wParam, lParam);
}

std::int32_t QtDesktop::HandleMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam) {
  constexpr std::uint32_t kNonClientLeftButtonDown = 0xA1;
  constexpr std::uint32_t kCaption = 2;
  FormView* view = ViewOf(window);
  if (!view || message != kNonClientLeftButtonDown || wParam != kCaption) return 0;
  mouse_.DragWindow(*view);
  return 0;
}

RegionHandle QtDesktop::CreateRoundRectRgn(int left, int top, int right, int bottom, int ellipseWidth,
                                           int ellipseHeight) {
  const RegionHandle handle(++lastRegion_);
  regions_[handle] = {left, top, right, bottom, ellipseWidth, ellipseHeight};
  return handle;
}

void QtDesktop::SetWindowRgn(WindowHandle window, RegionHandle region, bool redraw) {
  FormView* view = ViewOf(window);
  if (!view) return;
  // A window owns the region that it was given, so the handle ends here; none takes the shape away.
  const auto found = regions_.extract(region);
  view->Shape(found ? std::optional(found.mapped()) : std::nullopt);
  if (redraw) view->update();
}

bool QtDesktop::SetWindowPos(WindowHandle window, InsertAfter insertAfter, int x, int y, int /*cx*/,
                             int /*cy*/, unsigned flags) {
  FormView* view = ViewOf(window);
  if (!view || !(flags & kKeepsSize)) return false;
  if (!(flags & kKeepsOrder)) view->PutAfter(insertAfter);
  if (!(flags & kKeepsPlace)) view->move(x, y);
  return true;
}

void QtDesktop::Repaint(Control& control) {
  if (auto* view = dynamic_cast<WidgetView*>(control.View())) view->Repaint();
}

void QtDesktop::CreateView(Form& form) {
  using Procedure = WindowProcedure::element_type;
  const WindowHandle window = Windows.Add(std::make_shared<Procedure>(
      [this](WindowHandle sentTo, std::uint32_t message, std::uint32_t wParam, std::uint32_t /*lParam*/) {
        return HandleMessage(sentTo, message, wParam);
      }));
  auto* view = new FormView(context_, form, window);
  windows_[view->Handle()] = view;
  form.Attach(view);
}

void QtDesktop::DestroyView(Form& form) {
  if (FormView* view = ViewOf(form)) Close(*view);
}

void QtDesktop::Close(FormView& view) {
  windows_.erase(view.Handle());
  Windows.Remove(view.Handle());
  view.Release();
  // Later: an event of this window may be what led here.
  view.Bury();
}

void QtDesktop::ShowView(Form& form, Modality modality, Form* owner) {
  FormView* view = ViewOf(form);
  if (!view) return;
  QWidget* over = owner ? ViewOf(*owner) : nullptr;
  if (modality == Modality::Modeless) return view->ShowOver(over);
  view->RunModal(over);
  dispatcher_.UnwindIfEnded();
}

// After what the handler does next: a program that shows another form at once goes on.
void QtDesktop::LastFormGone() {
  Post([this] {
    if (windows_.empty()) dispatcher_.Quit(0);
  });
}

} // namespace quendra::forms::qt

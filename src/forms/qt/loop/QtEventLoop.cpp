#include "forms/qt/loop/QtEventLoop.h"

#include <QAbstractEventDispatcher>
#include <QCoreApplication>
#include <QEvent>
#include <QPointer>
#include <QSocketNotifier>
#include <QTimer>

namespace quendra::forms::qt {

namespace {

/// Owns a notifier or timer. It may go from within its own callback, so the object itself goes later.
template <typename Source> class SourceSubscription : public platform::EventLoop::Subscription {
 public:
  explicit SourceSubscription(Source* source) : source_(source) {}
  ~SourceSubscription() override {
    if (!source_) return;
    source_->disconnect();
    Silence(*source_);
    source_->deleteLater();
  }

 private:
  static void Silence(QSocketNotifier& notifier) { notifier.setEnabled(false); }
  static void Silence(QTimer& timer) { timer.stop(); }

  QPointer<Source> source_;
};

} // namespace

void QtEventLoop::Post(std::function<void()> work) {
  {
    const std::scoped_lock lock(arrivedLock_);
    arrived_.push_back(std::move(work));
    workArrived_.store(true, std::memory_order_relaxed);
  }
  // One event for each piece of work: the toolkit keeps their order and gives other events their turn between
  // pumps.
  QCoreApplication::postEvent(this, new QEvent(QEvent::User));
}

void QtEventLoop::Collect() {
  const std::scoped_lock lock(arrivedLock_);
  for (PostedWork::Work& work : arrived_) posted_.Add(std::move(work));
  arrived_.clear();
  workArrived_.store(false, std::memory_order_relaxed);
}

bool QtEventLoop::event(QEvent* event) {
  if (event->type() != QEvent::User) return QObject::event(event);
  Collect();
  posted_.RunNext([this](const PostedWork::Work& work) { dispatcher_.Dispatch(work); });
  return true;
}

std::unique_ptr<platform::EventLoop::Subscription> QtEventLoop::WatchDescriptor(int descriptor,
                                                                                std::function<void()> ready) {
  auto* notifier = new QSocketNotifier(descriptor, QSocketNotifier::Read, this);
  QObject::connect(notifier, &QSocketNotifier::activated, notifier,
                   [this, ready = std::move(ready)] { dispatcher_.Dispatch(ready); });
  return std::make_unique<SourceSubscription<QSocketNotifier>>(notifier);
}

std::unique_ptr<platform::EventLoop::Subscription> QtEventLoop::StartTimer(int milliseconds,
                                                                           std::function<void()> tick) {
  auto* timer = new QTimer(this);
  timer->setTimerType(milliseconds < 20 ? Qt::PreciseTimer : Qt::CoarseTimer);
  QObject::connect(timer, &QTimer::timeout, timer,
                   [this, tick = std::move(tick)] { dispatcher_.Dispatch(tick); });
  timer->start(milliseconds);
  return std::make_unique<SourceSubscription<QTimer>>(timer);
}

void QtEventLoop::PumpOnce() {
  // Within a piece of work the toolkit takes those posted before it began for handled, and would pass them
  // over.
  if (!posted_.IsEmpty()) QAbstractEventDispatcher::instance()->wakeUp();
  QCoreApplication::processEvents();
  gate_.Pumped();
  dispatcher_.UnwindIfEnded();
}

} // namespace quendra::forms::qt

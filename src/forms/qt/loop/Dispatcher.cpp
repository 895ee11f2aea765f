#include "forms/qt/loop/Dispatcher.h"

#include <QCoreApplication>

namespace quendra::forms::qt {

void Dispatcher::Quit(int status) {
  if (ended_) return;
  ended_ = true;
  status_ = status;
  QCoreApplication::exit(status);
}

void Dispatcher::Report(int number, const Text& description) {
  // Marked before the box: its loop would let other handlers run on a program that has failed.
  ended_ = true;
  status_ = 1;
  showFault_(u"Run-time error '" + DecimalText(number) + u"':\n\n" + description);
  QCoreApplication::exit(status_);
}

} // namespace quendra::forms::qt

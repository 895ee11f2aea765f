#include "forms/loop/Dispatcher.h"

namespace quendra::forms {

void Dispatcher::Quit(int status) {
  if (ended_) return;
  ended_ = true;
  status_ = status;
  leaveLoops_(status);
}

void Dispatcher::End(int status) {
  Quit(status);
  throw ProgramEnded{status_};
}

void Dispatcher::Report(int number, const Text& description) {
  // Marked before the box: its loop would let other handlers run on a program that has failed.
  ended_ = true;
  status_ = 1;
  showFault_(u"Run-time error '" + DecimalText(number) + u"':\n\n" + description);
  leaveLoops_(status_);
}

} // namespace quendra::forms

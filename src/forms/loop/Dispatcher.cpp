#include "forms/loop/Dispatcher.h"

#include <new>

namespace quendra::forms {

namespace {

Text Told(int number, const Text& description) {
  return u"Run-time error '" + DecimalText(number) + u"':\n\n" + description;
}

/// What the run-time says of the exception under way.
Text MessageOfThrown() {
  try {
    throw;
  } catch (const Fault& fault) {
    return Told(fault.number, fault.description);
  } catch (const std::bad_alloc&) {
    return Told(Fault::kOutOfMemory, Fault(Fault::kOutOfMemory).description);
  } catch (const std::exception& error) {
    return Told(51, u"Internal error: " + FromUtf8(error.what()));
  }
}

} // namespace

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

void Dispatcher::ReportThrown() noexcept {
  // Marked before the box: its loop would let other handlers run on a program that has failed.
  ended_ = true;
  status_ = 1;
  try {
    showFault_(MessageOfThrown());
    // A program without memory or windows has none for the message either.
    // NOLINTNEXTLINE(bugprone-empty-catch): it ends all the same.
  } catch (...) {
  }
  leaveLoops_(status_);
}

} // namespace quendra::forms

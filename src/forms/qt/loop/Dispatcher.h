#pragma once

#include "forms/Desktop.h"
#include "runtime/Fault.h"

#include <functional>
#include <new>
#include <utility>

namespace quendra::forms::qt {

/// The one gate through which the toolkit's events enter handlers. No exception leaves it: the toolkit's
/// frames between a handler and the loop cannot be unwound. The end of the program is marked here, and
/// whoever pumps messages further down the stack asks for the mark and goes on unwinding.
class Dispatcher {
 public:
  /// Shows the text of a fault that nobody trapped.
  explicit Dispatcher(std::function<void(const Text&)> showFault) : showFault_(std::move(showFault)) {}

  /// Runs a handler, unless the program has ended.
  template <typename Handler> void Dispatch(Handler&& handler) {
    if (ended_) return;
    try {
      std::forward<Handler>(handler)();
    } catch (const ProgramEnded& end) {
      Quit(end.status);
    } catch (const Fault& fault) {
      Report(fault.number, fault.description);
    } catch (const std::bad_alloc&) {
      Report(Fault::kOutOfMemory, Fault(Fault::kOutOfMemory).description);
    } catch (const std::exception& error) {
      Report(51, u"Internal error: " + FromUtf8(error.what()));
    }
  }

  bool Ended() const { return ended_; }
  int Status() const { return status_; }
  /// Marks the end and leaves every loop. The first status stands.
  void Quit(int status);
  /// Throws ProgramEnded once the end is marked.
  void UnwindIfEnded() const {
    if (ended_) throw ProgramEnded{status_};
  }

 private:
  void Report(int number, const Text& description);

  std::function<void(const Text&)> showFault_;
  bool ended_ = false;
  int status_ = 0;
};

} // namespace quendra::forms::qt

#pragma once

#include "forms/MessageLoop.h"
#include "runtime/Fault.h"

#include <exception>
#include <functional>
#include <utility>

namespace quendra::forms {

/// The one gate through which a desktop's events enter handlers. No exception leaves it: the frames of a
/// toolkit between a handler and the loop cannot be unwound. The end of the program is marked here, and
/// whoever pumps messages further down the stack asks for the mark and goes on unwinding.
class Dispatcher {
 public:
  /// `showFault` shows the text of a fault that nobody trapped and waits until it was read; `leaveLoops`
  /// makes every loop of the toolkit return, the program having ended with this status.
  Dispatcher(std::function<void(const Text&)> showFault, std::function<void(int)> leaveLoops)
      : showFault_(std::move(showFault)), leaveLoops_(std::move(leaveLoops)) {}

  /// Runs a handler, unless the program has ended.
  template <typename Handler> void Dispatch(Handler&& handler) {
    if (ended_) return;
    try {
      std::forward<Handler>(handler)();
    } catch (const ProgramEnded& end) {
      Quit(end.status);
    } catch (const std::exception&) {
      ReportThrown();
    }
  }

  bool Ended() const { return ended_; }
  int Status() const { return status_; }
  /// Marks the end and leaves every loop. The first status stands.
  void Quit(int status);
  /// Quits and unwinds the handler under way.
  [[noreturn]] void End(int status);
  /// Throws ProgramEnded once the end is marked.
  void UnwindIfEnded() const {
    if (ended_) throw ProgramEnded{status_};
  }

 private:
  /// Shows what was thrown, if that can be done, and leaves the loops in any case.
  void ReportThrown() noexcept;

  std::function<void(const Text&)> showFault_;
  std::function<void(int)> leaveLoops_;
  bool ended_ = false;
  int status_ = 0;
};

} // namespace quendra::forms

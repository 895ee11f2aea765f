#pragma once

#include "forms/WindowProcedures.h"
#include "foundation/iSubCls.h"
#include "runtime/Integers.h"

namespace quendra::foundation {

/// Lets its owner see chosen messages of a window, or all of them.
class cSubCls {
 public:
  explicit cSubCls(forms::WindowProcedures& windows) : windows_(windows) {}
  ~cSubCls() { UnSubclass(); }
  cSubCls(const cSubCls&) = delete;
  cSubCls& operator=(const cSubCls&) = delete;

  /// A message that the owner is to see, before the procedure that stands there or after it. Where a message
  /// was added twice the first counts. Has no effect while attached.
  void AddMsg(std::uint32_t uMsg, Boolean16 bBefore);
  /// Attaches. With `bAllMessages` the owner sees every message, after. The owner must outlive the
  /// attachment. Does nothing while attached.
  void SubClass(WindowHandle hWnd, iSubCls& owner, Boolean16 bAllMessages);
  /// Detaches and forgets the messages; a message under way finds the procedure before alone. Does nothing
  /// unless attached.
  void UnSubclass();

  Boolean16 Subclassed() const { return attached_ ? kTrue16 : kFalse16; }
  WindowHandle Window() const { return window_; }

 private:
  struct FilterEntry {
    std::uint32_t message;
    bool before;
  };
  using Filter = std::vector<FilterEntry>;

  /// What takes the procedure's place. It lives as long as a message is in it.
  struct Replacement {
    forms::WindowProcedures& windows;
    iSubCls* owner; ///< nullptr once detached
    bool allMessages;
    Filter filter;
    forms::WindowProcedure previous;

    std::int32_t Handle(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                        std::uint32_t lParam);

   private:
    enum class Moment { Never, Before, After };
    Moment MomentOf(std::uint32_t message) const;
  };

  forms::WindowProcedures& windows_;
  WindowHandle window_;
  Filter filter_;
  std::shared_ptr<Replacement> attached_;
};

} // namespace quendra::foundation

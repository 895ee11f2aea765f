#pragma once

#include "forms/Form.h"
#include "forms/controls/Controls.h"
#include "runtime/Integers.h"

namespace quendra::forms {

/// What a window and its menu say of a page.
struct PageRow {
  const char16_t* caption;
  const char* artwork;   ///< the picture of its button; with "_hot" after it, that of the highlighted button
  const char16_t* frame; ///< the name of its frame
  bool stopsWithItsWindow; ///< stopped too when the window unloads while the page is open
};

/// A window with pages, as its pages see it.
class PageWindow : public Form {
 public:
  using Form::Form;

  /// Puts the menu back to normal, stops the visible page and hides all.
  virtual void resetButtons() = 0;
  /// For a handler of the mouse's moves: shows the system's hand, where it has one.
  virtual void ShowHandCursor() = 0;
  /// Kept at each activation and deactivation; nothing reads it.
  Boolean16 InBackground = kFalse16;
};

/// A page of a window: a frame with what stands on it. Whoever does the page's work, itself or a module that
/// is made later, answers its start and its stop.
class Page {
 public:
  Page(PageWindow& window, const PageRow& row) : row(row), window(window), frame(window, row.frame) {}
  virtual ~Page() = default;
  Page(const Page&) = delete;
  Page& operator=(const Page&) = delete;

  /// Puts every control of the page into its state of design time. Run at each load of the window, which has
  /// placed the frame and hidden it.
  virtual void Design() = 0;
  bool IsOpen() const { return frame.Visible(); }

  /// Raised before the window shows the page.
  Event<> Start;
  /// Raised before the window hides the page that is open.
  Event<> Stop;

  const PageRow& row;
  PageWindow& window;
  Frame frame;
};

} // namespace quendra::forms

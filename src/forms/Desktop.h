#pragma once

#include "forms/Controls.h"
#include "forms/Form.h"
#include "forms/MessageWindows.h"

#include <functional>

namespace quendra::forms {

/// Thrown by `Desktop::End` and by whatever pumps messages once the program has ended: unwinds every handler
/// under way. Only desktops catch it.
struct ProgramEnded {
  int status = 0;
};

enum class Modality { Modeless, Modal };

/// Flags of a message box, as the platform numbers them.
enum BoxFlags : int {
  kCritical = 0x10,
  kExclamation = 0x30,
  kInformation = 0x40,
  kRightAligned = 0x80000,
  kRightToLeft = 0x100000,
  kHebrewBox = kRightAligned | kRightToLeft,
};

using RegionHandle = OpaqueHandle<struct RegionKind>;
using CursorHandle = OpaqueHandle<struct CursorKind>;
inline constexpr CursorHandle kNoCursor;

/// What the program's logic sees of the desktop that shows its forms. One thread.
class Desktop {
 public:
  virtual ~Desktop() = default;

  // Forms.

  /// An empty Tag, Design, then Form_Load. Does nothing for a loaded form. A fault that Form_Load lets escape
  /// leaves the form loaded.
  void Load(Form& form);
  /// Loads where needed and makes visible. Modal returns when the form is hidden or unloaded; `owner` may be
  /// nullptr.
  void Show(Form& form, Modality modality = Modality::Modeless, Form* owner = nullptr);
  /// Form_Unload, then the view goes. Does nothing for a form that isn't loaded or that unloads already. When
  /// the last form has gone the program ends with status 0.
  void Unload(Form& form);
  /// Ends the program at once: no further unloading. Throws ProgramEnded.
  [[noreturn]] virtual void End(int status = 0) = 0;

  // Messages and boxes.

  /// Waits for an answer; gives the pressed button's number, 1 for OK.
  virtual int MessageBox(const Text& text, int flags, const Text& title) = 0;
  /// Handles what waits in the message queue, then returns. Cheap when nothing waits.
  virtual void DoEvents() = 0;

  /// The windows that exist for their messages alone.
  MessageWindows Windows;

  // Mouse, window shape and messages.

  /// Handle of a system cursor, kNoCursor when there is none. 32649 is the hand.
  virtual CursorHandle LoadCursor(int id) = 0;
  virtual void SetCursor(CursorHandle cursor) = 0;
  virtual WindowHandle HandleOf(Form& form) = 0;
  virtual void ReleaseCapture() = 0;
  virtual std::int32_t SendMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                                   std::uint32_t lParam) = 0;
  virtual double TwipsPerPixelX() const = 0;
  virtual double TwipsPerPixelY() const = 0;
  /// Pixels: left, top, right, bottom, width and height of the corner ellipses.
  virtual RegionHandle CreateRoundRectRgn(int left, int top, int right, int bottom, int ellipseWidth,
                                          int ellipseHeight) = 0;
  virtual void SetWindowRgn(WindowHandle window, RegionHandle region, bool redraw) = 0;

  // Drawing on picture boxes; all numbers in the box's ScaleMode unit.

  virtual int ScaleWidth(const PictureBox& box) const = 0;
  virtual int ScaleHeight(const PictureBox& box) const = 0;
  virtual int TextWidth(const PictureBox& box, TextView text) const = 0;
  virtual int TextHeight(const PictureBox& box, TextView text) const = 0;
  virtual void Cls(PictureBox& box) = 0;
  /// A filled box with both corners in it.
  virtual void FillBox(PictureBox& box, int x1, int y1, int x2, int y2, Colour colour) = 0;
  /// Prints at CurrentX and CurrentY in ForeColour and moves to the start of the next line. A box of a form
  /// that reads from right to left prints from its right edge.
  virtual void Print(PictureBox& box, TextView text) = 0;
  /// Copies in pixels, as SRCCOPY does.
  virtual void BitBlt(PictureBox& target, int x, int y, int width, int height, const PictureBox& source,
                      int sourceX, int sourceY) = 0;
  /// Shows what was drawn.
  virtual void Refresh(PictureBox& box) = 0;
  /// Draws an icon's image, in any format that desktops know (PNG, SVG or XPM bytes), scaled to width by
  /// height. False when the bytes are no image; nothing is drawn then.
  virtual bool DrawIconEx(PictureBox& box, int x, int y, const std::vector<std::uint8_t>& image, int width,
                          int height) = 0;
  /// What the box holds now, drawings included.
  virtual Picture ImageOf(const PictureBox& box) const = 0;

 protected:
  /// A message box or a modal form, counted as standing as long as this lives.
  class Standing {
   public:
    explicit Standing(Desktop& desktop) : count_(desktop.standing_) { ++count_; }
    ~Standing() { --count_; }
    Standing(const Standing&) = delete;
    Standing& operator=(const Standing&) = delete;

   private:
    int& count_;
  };
  int StandingCount() const { return standing_; }

  virtual void CreateView(Form& form) = 0;
  virtual void DestroyView(Form& form) = 0;
  virtual void ShowView(Form& form, Modality modality, Form* owner) = 0;
  /// The last loaded form has gone.
  virtual void LastFormGone() = 0;

 private:
  int loadedForms_ = 0;
  int standing_ = 0;
};

} // namespace quendra::forms

#pragma once

#include "forms/Desktop.h"
#include "forms/controls/ComboBox.h"
#include "forms/controls/ListView.h"
#include "forms/headless/HeadlessLoop.h"
#include "forms/loop/Dispatcher.h"
#include "forms/view/ActiveForm.h"

#include <deque>
#include <map>
#include <unordered_map>

namespace quendra::forms::headless {

/// A desktop without a screen, for tests: boxes answer as scripted, what the program asks for is recorded,
/// time moves when the test says so, and the user's actions are calls.
class HeadlessDesktop : public Desktop, public HeadlessLoop {
 public:
  HeadlessDesktop();
  ~HeadlessDesktop() override;

  void PostMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                   std::uint32_t lParam) override {
    Post([=, this] { Windows.Dispatch(window, message, wParam, lParam); });
  }
  std::uint32_t RegisterWindowMessageA(const std::string& name) override;
  int ModalDepth() const override { return StandingCount(); }

  /// Pixels: how wide each character and how high each line is in any font.
  static constexpr int CharacterWidth = 8;
  static constexpr int LineHeight = 16;

  // What the program showed and asked for.

  struct Box {
    Text text{};
    int flags = 0;
    Text title{};
    friend bool operator==(const Box&, const Box&) = default;
  };
  std::vector<Box> Boxes;
  /// One text a call: the operation's name and its numbers, as in "SetCursor 5"; windows and picture boxes
  /// stand by their names, as in "SendMessage frmMenu 0xA1 2 0".
  std::vector<std::string> Calls;
  /// How often a text stands in Calls.
  int CountOf(const std::string& call) const;
  int YieldCount = 0;
  bool Ended = false;
  int EndStatus = 0;

  // What the test scripts.

  /// Boxes without a scripted answer are answered with 1 (OK).
  void AnswerNextBox(int answer) { answers_.push_back(answer); }
  bool FailRegisterWindowMessage = false;
  CursorHandle CursorHandleToGive{5};
  /// Called at each DoEvents, before the queue is handled; not from within itself.
  std::function<void()> OnYield;
  /// What happens while a message box stands. Without it a box is answered at once.
  std::function<void()> OnBox;
  /// What happens while a modal form stands. Without it a modal form returns at once and stays visible.
  std::function<void(Form&)> OnModal;

  // The user. Each is dispatched as an event; false when the user could not do it: the control isn't shown,
  // or it or a container of it is disabled, or the program has ended.

  bool Click(Control& control);
  bool DoubleClick(Control& control);
  bool MouseMove(Control& control, int button = 0, int shift = 0, int x = 0, int y = 0);
  bool MouseDown(Control& control, int button = kLeftButton, int shift = 0, int x = 0, int y = 0);
  /// A key that no control takes: the form's preview, then its Default or Cancel control.
  bool KeyDown(Form& form, int keyCode, int shift = 0);
  /// A key that goes to the control with the focus: Tab moves on, Enter and Space press a label, and what it
  /// doesn't take is the form's.
  bool PressKey(Form& form, int keyCode, int shift = 0);
  /// Puts the focus into a field and types there, character after character; 8 is the backspace, 13 Enter.
  bool Type(Control& field, TextView text);
  bool CloseBox(Form& form);
  /// An item from 0; one that the list lacks can't be chosen.
  bool ChooseItem(ComboBox& combo, int index);
  bool ChooseItem(ListBox& list, int index);
  /// A header from 1.
  bool ClickHeader(ListView& list, int header);
  /// A row from 1: selects it, then clicks the list.
  bool ClickRow(ListView& list, int row);
  /// Another window takes the focus, or this one gets it back.
  bool Activate(Form& form);
  bool Deactivate(Form& form);

  /// Runs work as the dispatcher runs a handler: a fault shows the run-time's message and ends the program
  /// with status 1; the program's end is kept in Ended and EndStatus. After the end nothing is run.
  void Dispatch(const std::function<void()>& work) override;

  // What stands on the screen.

  /// The form as text: one line a visible control, those inside a container further in; a list as a table of
  /// its rows.
  std::string Render(Form& form) const;
  /// What was drawn on a box since it was cleared, one text a drawing: "Box 0,-1 400,5 999999", "Print 0,20
  /// FFFFFF text", "Icon 0,0 32x32 of 12 bytes". A copy that covers the whole box takes the source's drawings
  /// in place of its own.
  const std::vector<std::string>& DrawingOf(const PictureBox& box) const;
  bool IsActive(const Form& form) const { return active_.Is(form); }
  /// The control that has the focus in a form, nullptr for none.
  Control* Focused(const Form& form) const;

  // Desktop.

  [[noreturn]] void End(int status = 0) override { dispatcher_.End(status); }
  int MessageBox(const Text& text, int flags, const Text& title) override;
  void DoEvents() override;
  CursorHandle LoadCursor(int id) override;
  void SetCursor(CursorHandle cursor) override;
  WindowHandle HandleOf(Form& form) override;
  void ReleaseCapture() override;
  std::int32_t SendMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                           std::uint32_t lParam) override;
  double TwipsPerPixelX() const override { return scale_.twipsPerPixelX; }
  double TwipsPerPixelY() const override { return scale_.twipsPerPixelY; }
  RegionHandle CreateRoundRectRgn(int left, int top, int right, int bottom, int ellipseWidth,
                                  int ellipseHeight) override;
  void SetWindowRgn(WindowHandle window, RegionHandle region, bool redraw) override;
  bool SetWindowPos(WindowHandle window, InsertAfter insertAfter, int x, int y, int cx, int cy,
                    unsigned flags) override;
  void Repaint(Control& control) override;
  void FillBox(PictureBox& box, int x1, int y1, int x2, int y2, Colour colour) override;
  void BitBlt(PictureBox& target, int x, int y, int width, int height, const PictureBox& source, int sourceX,
              int sourceY) override;
  void Refresh(PictureBox& box) override;
  /// Any bytes are an image here, none are not.
  bool DrawIconEx(PictureBox& box, int x, int y, const std::vector<std::uint8_t>& image, int width,
                  int height) override;
  /// Two pixels that stand for the contents; equal contents give equal pictures.
  Picture ImageOf(const PictureBox& box) const override;

 protected:
  void CreateView(Form& form) override;
  void DestroyView(Form& form) override;
  void ShowView(Form& form, Modality modality, Form* owner) override;
  void LastFormGone() override;

  const Scale& ScreenScale() const override { return scale_; }
  int WidthInPixels(const PictureBox& box, TextView text) const override;
  int LineHeightInPixels(const PictureBox& box) const override;
  void DropDrawings(PictureBox& box) override;
  void PrintLine(PictureBox& box, TextView text, const Area& place) override;

 private:
  class FormView;

  /// Something is under way as long as this lives.
  class Inside {
   public:
    explicit Inside(int& depth) : depth_(depth) { ++depth_; }
    ~Inside() { --depth_; }
    Inside(const Inside&) = delete;
    Inside& operator=(const Inside&) = delete;

   private:
    int& depth_;
  };

  void ShowBox(const Text& text, int flags, const Text& title);
  /// Ends the program unless a form was loaded since the last one went.
  void EndWithoutForms();
  bool Act(Control& control, const std::function<void()>& action);
  void MoveFocus(const Form& form, Control* to);
  /// A key that gives this character comes to the field that has the focus.
  void TypeInto(Control& field, int character);
  void Record(std::string call) { Calls.push_back(std::move(call)); }
  void Draw(PictureBox& box, const std::string& drawing);
  std::string NameOfWindow(WindowHandle window) const;
  void Forget(const Form& form);

  const Scale scale_{};
  Dispatcher dispatcher_;
  std::deque<int> answers_;
  int yielding_ = 0;
  int handlers_ = 0; ///< how many are under way, one inside the other
  bool lastFormWent_ = false;
  ActiveForm active_;
  std::unordered_map<const Form*, WindowHandle> windows_;
  std::map<WindowHandle, std::string> windowNames_;
  std::uint32_t lastRegion_ = 0;
  std::unordered_map<const PictureBox*, std::vector<std::string>> drawings_;
  mutable std::map<std::string, Picture> images_;
  std::unordered_map<const Form*, std::unique_ptr<FormView>>
      views_; // last: a view that goes drops its drawings
};

} // namespace quendra::forms::headless

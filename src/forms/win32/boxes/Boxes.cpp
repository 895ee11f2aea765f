#include "forms/win32/boxes/Boxes.h"

#include "forms/win32/boxes/BoxViews.h"

namespace quendra::forms::win32 {

namespace {

void Sound(BoxSign sign) {
  switch (sign) {
  case BoxSign::None: return (void)::MessageBeep(MB_OK);
  case BoxSign::Critical: return (void)::MessageBeep(MB_ICONHAND);
  case BoxSign::Question: return (void)::MessageBeep(MB_ICONQUESTION);
  case BoxSign::Exclamation: return (void)::MessageBeep(MB_ICONEXCLAMATION);
  case BoxSign::Information: return (void)::MessageBeep(MB_ICONASTERISK);
  }
}

/// A question wants an answer: nothing but its buttons closes it.
void DimCloseBox(HWND window) {
  ::EnableMenuItem(::GetSystemMenu(window, FALSE), SC_CLOSE, MF_BYCOMMAND | MF_GRAYED);
}

} // namespace

int ShowBox(const ViewContext& desktops, FormWindow* owner, const BoxContent& content, const Waiter& wait) {
  // Buttons work also in the box that tells of the program's end. One that fails itself goes with its default
  // answer: none of its buttons would work any more.
  bool failed = false;
  Dispatcher dispatcher([](const Text&) {}, [&failed](int) { failed = true; });
  ActiveForm active;
  FormState state;
  ViewContext context{desktops.desktop,    dispatcher,     desktops.scale,
                      desktops.pictures,   desktops.fonts, desktops.mouse,
                      desktops.startTimer, active,         state};
  BoxForm box(content, context, UsableScreenRound(owner ? owner->Top() : nullptr).extent);
  FormWindow window(context, box, kNoWindow, MakeBoxView);
  window.OnClose = [&] { box.AnswerBy(content.cancelButton); };
  if (content.cancelButton == 0) DimCloseBox(window.Top());
  box.Attach(&window);
  Sound(content.sign);
  window.RunModal(owner, [&](const std::function<bool()>& done) {
    // Assistive technology reads out what comes up with an alert.
    ::NotifyWinEvent(EVENT_SYSTEM_ALERT, window.Top(), OBJID_WINDOW, CHILDID_SELF);
    wait([&] { return failed || done(); });
  });
  window.Release();
  return box.Answer();
}

} // namespace quendra::forms::win32

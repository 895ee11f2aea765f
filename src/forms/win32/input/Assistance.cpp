#include "forms/win32/input/Assistance.h"

#include "forms/view/Accessible.h"

namespace quendra::forms::win32 {

namespace {

/// The numbers of the system's classes, as they are published for OBJID_QUERYCLASSNAMEIDX.
std::optional<LRESULT> ClassOf(Control& control) {
  constexpr LRESULT kClasses = 65536;
  // Their proxies would keep silent about what stands in it.
  const Container* const holder = control.AsContainer();
  if (holder && !holder->Children().empty()) return std::nullopt;
  switch (AccessibleOf(control).role) {
  case Role::Button: return kClasses + 2;
  case Role::Text: return kClasses + 3;
  default: return std::nullopt;
  }
}

// A window that a box or a modal form keeps the user from is disabled, but gets messages.
bool IsPressable(const WindowView& view) {
  return OffersPress(*view.TheControl()) && ::IsWindowEnabled(::GetAncestor(view.Window(), GA_ROOT));
}

} // namespace

std::optional<LRESULT> AnswerAssistance(WindowView& view, UINT message, LPARAM lParam) {
  if (!view.TheControl()) return std::nullopt;
  if (message == WM_GETOBJECT && static_cast<LONG>(lParam) == OBJID_QUERYCLASSNAMEIDX)
    return ClassOf(*view.TheControl());
  if (message != BM_CLICK || !IsPressable(view)) return std::nullopt;
  // Who sent it goes on: the handler may wait for the user.
  ::ReplyMessage(0);
  view.Press();
  return 0;
}

} // namespace quendra::forms::win32

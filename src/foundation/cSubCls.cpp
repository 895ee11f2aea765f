#include "foundation/cSubCls.h"

#include <algorithm>
#include <utility>

namespace quendra::foundation {

void cSubCls::AddMsg(std::uint32_t uMsg, Boolean16 bBefore) {
  if (!attached_) filter_.push_back({uMsg, bBefore != kFalse16});
}

void cSubCls::SubClass(WindowHandle hWnd, iSubCls& owner, Boolean16 bAllMessages) {
  if (attached_) return;
  window_ = hWnd;
  attached_ = std::make_shared<Replacement>(
      Replacement{windows_, &owner, bAllMessages != kFalse16, filter_, windows_.Procedure(hWnd)});
  using Procedure = forms::WindowProcedure::element_type;
  windows_.Replace(hWnd, std::make_shared<Procedure>([replacement = attached_](auto... message) {
                     return replacement->Handle(message...);
                   }));
}

void cSubCls::UnSubclass() {
  if (!attached_) return;
  const auto detached = std::exchange(attached_, nullptr);
  detached->owner = nullptr;
  windows_.Replace(window_, detached->previous);
  filter_.clear();
}

cSubCls::Replacement::Moment cSubCls::Replacement::MomentOf(std::uint32_t message) const {
  if (!owner) return Moment::Never;
  if (allMessages) return Moment::After;
  const auto found = std::find_if(filter.begin(), filter.end(),
                                  [&](const FilterEntry& entry) { return entry.message == message; });
  if (found == filter.end()) return Moment::Never;
  return found->before ? Moment::Before : Moment::After;
}

std::int32_t cSubCls::Replacement::Handle(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                                          std::uint32_t lParam) {
  const Moment moment = MomentOf(message);
  if (moment == Moment::Before) {
    std::int32_t handled = 0;
    std::int32_t result = 0;
    owner->Antes(handled, result, window, message, wParam, lParam);
    if (handled != 0) return result;
  }
  std::int32_t result = windows.Call(previous, window, message, wParam, lParam);
  // The owner may have gone meanwhile.
  if (moment == Moment::After && owner) owner->Despues(result, window, message, wParam, lParam);
  return result;
}

} // namespace quendra::foundation

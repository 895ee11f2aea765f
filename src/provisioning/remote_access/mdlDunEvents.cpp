#include "forms/Desktop.h"
#include "provisioning/remote_access/mdlDun.h"

namespace quendra::provisioning {

/// What the replaced procedure holds: it may outlive the module.
struct mdlDun::Hook {
  mdlDun* owner; ///< nullptr once it has gone
  const forms::WindowProcedures& windows;
};

mdlDun::mdlDun(const RemoteAccess& remoteAccess, platform::System& system, forms::Desktop& desktop)
    : phoneBook_(remoteAccess.phoneBook), dialling_(remoteAccess.dialling), system_(system),
      desktop_(desktop), hook_(std::make_shared<Hook>(Hook{this, desktop.Windows})) {
  using Procedure = forms::WindowProcedure::element_type;
  hookProcedure_ = std::make_shared<Procedure>(
      [hook = hook_](WindowHandle window, std::uint32_t message, std::uint32_t wParam, std::uint32_t lParam) {
        return hook->owner ? hook->owner->DialEventWndProc(window, message, wParam, lParam)
                           : hook->windows.Call(nullptr, window, message, wParam, lParam);
      });
}

mdlDun::~mdlDun() { hook_->owner = nullptr; }

void mdlDun::HookDialEvents(WindowHandle window) {
  if (HookedWindow != kNoWindow) UnhookDialEvents(HookedWindow);
  HookedWindow = window;
  PreviousWndProc = desktop_.Windows.Replace(window, hookProcedure_);
  if (RasDialEventMessage == 0)
    RasDialEventMessage = desktop_.RegisterWindowMessageA(platform::kRasDialEventName);
  if (RasDialEventMessage == 0) RasDialEventMessage = platform::kRasDialEvent;
}

void mdlDun::UnhookDialEvents(WindowHandle window) {
  if (HookedWindow == kNoWindow) return;
  desktop_.Windows.Replace(window, PreviousWndProc);
  RasDialEventMessage = 0;
  HookedWindow = kNoWindow;
}

std::int32_t mdlDun::DialEventWndProc(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                                      std::uint32_t lParam) {
  if (message == RasDialEventMessage && OnDialEvent) {
    const auto handler = OnDialEvent; // which may put another in its place
    handler(message, wParam, lParam);
  }
  return desktop_.Windows.Call(PreviousWndProc, window, message, wParam, lParam);
}

} // namespace quendra::provisioning

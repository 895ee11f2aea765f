#include "platform/simulated/net/SocketMessages.h"

namespace quendra::platform::simulated {

void SocketMessages::Later(std::function<void()> work) {
  if (!loop_) return;
  loop_->Post([life = std::weak_ptr(life_), work = std::move(work)] {
    if (!life.expired()) work();
  });
}

void SocketMessages::Post(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                          std::uint32_t lParam) {
  if (loop_) loop_->PostMessage(window, message, wParam, lParam);
}

void SocketMessages::Announce(SocketEnd& end, SocketEvent event, std::int32_t error) {
  if (loop_ && end.handle != kNoSocket) end.selection.Announce(*loop_, end.handle, event, error);
}

void SocketMessages::Update(SocketEnd& end) {
  using Stage = SocketEnd::Stage;
  if (end.stage == Stage::Listening && !end.backlog.empty()) Announce(end, kFdAccept);
  if (end.stage == Stage::Datagram && !end.datagrams.empty()) Announce(end, kFdRead);
  if (end.stage == Stage::Datagram) Announce(end, kFdWrite);
  if (end.stage != Stage::Connected) return;
  if (end.room > 0) Announce(end, kFdWrite);
  if (!end.arrived.empty()) return Announce(end, kFdRead);
  // The end is announced after the last data was read.
  if (end.ended && (end.selection.enabled & kFdRead) != 0) Announce(end, kFdClose, end.endError);
}

} // namespace quendra::platform::simulated

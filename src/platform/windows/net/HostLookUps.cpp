#include "platform/windows/net/HostLookUps.h"

#include "platform/net/AddressList.h"
#include "platform/windows/net/HostEntry.h"

#include <algorithm>
#include <iterator>
#include <vector>

namespace quendra::platform::windows {

// What the system still works on it may write to at any time, even when it has agreed to stop: such blocks
// are left to it for good.
HostLookUps::~HostLookUps() {
  for (LookUp& lookUp : underWay_) {
    if (!lookUp.isCancelled) library_.WSACancelAsyncRequest(lookUp.request);
    static_cast<void>(lookUp.found.release());
  }
}

LookUpHandle HostLookUps::Start(HWND relay, UINT relayed, const std::string& name, const Asker& asker) {
  auto found = std::make_unique<Block>();
  const HANDLE request = library_.WSAAsyncGetHostByName(relay, relayed, name.c_str(), found->data(),
                                                        static_cast<int>(found->size()));
  if (!request) return kNoLookUp;
  // A cancelled one whose number the system gives again is over.
  std::erase_if(underWay_, [&](const LookUp& old) { return old.request == request; });
  underWay_.push_back({LookUpHandle(++last_), request, asker, std::move(found)});
  return underWay_.back().handle;
}

bool HostLookUps::Cancel(LookUpHandle handle) {
  const auto found = std::ranges::find_if(
      underWay_, [&](const LookUp& lookUp) { return lookUp.handle == handle && !lookUp.isCancelled; });
  if (found == underWay_.end()) return false;
  found->isStopped = library_.WSACancelAsyncRequest(found->request) == 0;
  found->isCancelled = true;
  LetOldStoppedOnesGo();
  return true;
}

void HostLookUps::CancelAll() {
  std::vector<LookUpHandle> all;
  std::ranges::transform(underWay_, std::back_inserter(all), &LookUp::handle);
  for (const LookUpHandle handle : all) Cancel(handle);
}

void HostLookUps::LetOldStoppedOnesGo() {
  if (std::ranges::count_if(underWay_, &LookUp::isStopped) <= kMostStopped) return;
  underWay_.erase(std::ranges::find_if(underWay_, &LookUp::isStopped));
}

void HostLookUps::OnEnd(HANDLE request, LPARAM result) {
  const auto found = std::ranges::find(underWay_, request, &LookUp::request);
  if (found == underWay_.end()) return;
  const LookUp ended = std::move(*found);
  underWay_.erase(found);
  if (ended.isCancelled) return;
  const std::int32_t error = WSAGETASYNCERROR(result);
  if (error == 0)
    PutAddressList(ended.asker.buffer, AddressesOf(*reinterpret_cast<const hostent*>(ended.found->data())));
  loop_.PostMessage(ended.asker.window, ended.asker.message, ended.handle.Value(),
                    SocketMessageWord(0, error));
}

} // namespace quendra::platform::windows

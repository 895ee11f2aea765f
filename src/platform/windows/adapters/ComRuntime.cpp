#include "platform/windows/adapters/ComRuntime.h"

namespace quendra::platform::windows {

ComRuntime::ComRuntime() {
  const auto begin = Ole<decltype(::CoInitializeEx)>("CoInitializeEx");
  if (!begin || !CreateInstance || !AllocString || !FreeString || !ClearVariant || !CreateVector ||
      !PutElement)
    return;
  const HRESULT result = begin(nullptr, COINIT_APARTMENTTHREADED);
  mustEnd_ = SUCCEEDED(result);
  // Somebody else on this thread has begun in another way, which serves as well.
  began_ = mustEnd_ || result == RPC_E_CHANGED_MODE;
}

ComRuntime::~ComRuntime() {
  const auto end = Ole<decltype(::CoUninitialize)>("CoUninitialize");
  if (mustEnd_ && end) end();
}

void ComRuntime::LetActAsUser(IUnknown* object) const {
  const auto set = Ole<decltype(::CoSetProxyBlanket)>("CoSetProxyBlanket");
  if (set)
    set(object, RPC_C_AUTHN_WINNT, RPC_C_AUTHZ_NONE, nullptr, RPC_C_AUTHN_LEVEL_CALL,
        RPC_C_IMP_LEVEL_IMPERSONATE, nullptr, EOAC_NONE);
}

} // namespace quendra::platform::windows

#include "platform/windows/icmp/IcmpLibrary.h"

#include <type_traits>

namespace quendra::platform::windows {

namespace {

winapi::SystemLibrary LibraryWithEchoes() {
  winapi::SystemLibrary helper(L"iphlpapi.dll");
  if (helper.Find<void()>("IcmpSendEcho")) return helper;
  return winapi::SystemLibrary(L"icmp.dll");
}

template <typename Call> bool Find(const winapi::SystemLibrary& library, const char* name, Call& call) {
  call = library.Find<std::remove_pointer_t<Call>>(name);
  return call != nullptr;
}

} // namespace

IcmpLibrary::IcmpLibrary() : library_(LibraryWithEchoes()), isThere_(FindAll()) {}

bool IcmpLibrary::FindAll() {
  return Find(library_, "IcmpCreateFile", IcmpCreateFile) &&
         Find(library_, "IcmpCloseHandle", IcmpCloseHandle) && Find(library_, "IcmpSendEcho", IcmpSendEcho);
}

} // namespace quendra::platform::windows

#include "platform/windows/icmp/IcmpLibrary.h"

namespace quendra::platform::windows {

namespace {

winapi::SystemLibrary LibraryWithEchoes() {
  winapi::SystemLibrary helper(L"iphlpapi.dll");
  if (helper.Find<void()>("IcmpSendEcho")) return helper;
  return winapi::SystemLibrary(L"icmp.dll");
}

} // namespace

IcmpLibrary::IcmpLibrary() : library_(LibraryWithEchoes()), isThere_(FindAll()) {}

bool IcmpLibrary::FindAll() {
  return Find(library_, "IcmpCreateFile", IcmpCreateFile) &&
         Find(library_, "IcmpCloseHandle", IcmpCloseHandle) && Find(library_, "IcmpSendEcho", IcmpSendEcho);
}

} // namespace quendra::platform::windows

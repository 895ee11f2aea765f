#include "platform/windows/net/IpHelperLibrary.h"

#include <type_traits>

namespace quendra::platform::windows {

IpHelperLibrary::IpHelperLibrary() {
  const auto find = [this](const char* name, auto& call) {
    call = library_.Find<std::remove_pointer_t<std::remove_reference_t<decltype(call)>>>(name);
  };
  find("AllocateAndGetTcpExTableFromStack", AllocateAndGetTcpExTableFromStack);
  find("GetExtendedTcpTable", GetExtendedTcpTable);
  find("GetAdaptersInfo", GetAdaptersInfo);
  find("GetIfTable", GetIfTable);
  find("GetIpForwardTable", GetIpForwardTable);
  find("SetTcpEntry", SetTcpEntry);
}

} // namespace quendra::platform::windows

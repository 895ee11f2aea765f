#include "platform/windows/icmp/WindowsIcmp.h"

#include "platform/icmp/EchoReply.h"

#include <cstring>

namespace quendra::platform::windows {

static_assert(sizeof(ICMP_ECHO_REPLY) == kEchoReplySize);
static_assert(sizeof(IP_OPTION_INFORMATION) == kEchoOptionsSize);

namespace {

/// What an ICMP message can carry behind its header.
constexpr std::size_t kMostData = 65507;
/// The library wants room for an error message of the network and for its own bookkeeping behind the data.
constexpr std::size_t kSpare = 64;

HANDLE SystemHandle(IcmpHandle handle) { return reinterpret_cast<HANDLE>(handle.Value()); }

std::uint32_t NoReply(std::span<std::uint8_t> buffer, std::uint32_t status) {
  PutEchoFailure(buffer, status);
  return 0;
}

/// The data as the record points to it, so far as that lies in the block.
std::span<const std::uint8_t> DataOf(const ICMP_ECHO_REPLY& record, std::span<const std::uint8_t> block) {
  const auto* data = static_cast<const std::uint8_t*>(record.Data);
  if (data < block.data() || data > block.data() + block.size()) return {};
  const auto room = static_cast<std::size_t>(block.data() + block.size() - data);
  return {data, std::min<std::size_t>(record.DataSize, room)};
}

EchoReply ReplyIn(std::span<const std::uint8_t> block) {
  ICMP_ECHO_REPLY record;
  std::memcpy(&record, block.data(), sizeof record);
  const auto data = DataOf(record, block);
  return {Ipv4Address::FromMemory(record.Address),
          record.Status,
          record.RoundTripTime,
          record.Options.Ttl,
          record.Options.Tos,
          {data.begin(), data.end()}};
}

} // namespace

IcmpHandle WindowsIcmp::IcmpCreateFile() {
  const HANDLE opened = library_.IsThere() ? library_.IcmpCreateFile() : INVALID_HANDLE_VALUE;
  if (opened == INVALID_HANDLE_VALUE) return kNoIcmp;
  const IcmpHandle handle(reinterpret_cast<std::uint32_t>(opened));
  open_.insert(handle);
  return handle;
}

std::uint32_t WindowsIcmp::IcmpSendEcho(IcmpHandle handle, const EchoRequest& request,
                                        std::span<std::uint8_t> replyBuffer, std::uint32_t milliseconds) {
  if (!open_.contains(handle) || request.data.size() > kMostData)
    return NoReply(replyBuffer, kEchoBadRequest);
  if (replyBuffer.size() < kEchoReplySize) return 0;
  IP_OPTION_INFORMATION options{};
  const bool hasOptions = request.options.size() >= kEchoOptionsSize;
  if (hasOptions) {
    options.Ttl = request.options[kOptionsTtl];
    options.Tos = request.options[kOptionsTos];
    options.Flags = request.options[kOptionsFlags];
  }
  std::vector<std::uint8_t> data(request.data.begin(), request.data.end());
  std::vector<std::uint8_t> block(kEchoReplySize + data.size() + kSpare);
  ::SetLastError(0);
  const DWORD replies = library_.IcmpSendEcho(SystemHandle(handle), request.address.InMemory(), data.data(),
                                              static_cast<WORD>(data.size()), hasOptions ? &options : nullptr,
                                              block.data(), static_cast<DWORD>(block.size()), milliseconds);
  if (replies == 0) {
    const DWORD error = ::GetLastError();
    return NoReply(replyBuffer, error != 0 ? error : std::uint32_t{kEchoGeneralFailure});
  }
  PutEchoReply(replyBuffer, ReplyIn(block));
  return 1;
}

bool WindowsIcmp::IcmpCloseHandle(IcmpHandle handle) {
  return open_.erase(handle) > 0 && library_.IcmpCloseHandle(SystemHandle(handle)) != FALSE;
}

} // namespace quendra::platform::windows

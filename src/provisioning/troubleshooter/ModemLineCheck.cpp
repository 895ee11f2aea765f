#include "provisioning/troubleshooter/ModemLineCheck.h"

#include "platform/icmp/IcmpNumbers.h"

namespace quendra::provisioning {

namespace {

constexpr std::array<const char16_t*, 3> kModemAddresses{u"10.0.0.138", u"192.168.0.1", u"10.0.0.1"};

} // namespace

// Names are compared where types could be: systems name their devices otherwise, and then nothing is asked.
bool ModemLineCheck::ModemAnswers(const Text& deviceName) {
  if (deviceName == u"pppoe") return PingRound();
  if (deviceName != u"vpn") return false;
  vpnAdapter_.ConfigureVpnAdapter(form_, VpnAdapter::Steps::Told);
  return PingRound();
}

bool ModemLineCheck::PingRound() {
  bool answered = false;
  for (const char16_t* address : kModemAddresses)
    if (Answers(address)) answered = true;
  return answered;
}

bool ModemLineCheck::Answers(const Text& address) {
  diagnostics::mdlPing::Reply reply{};
  const std::int32_t status = mdlPing_.Ping(address, reply);
  if (status == platform::kEchoSuccess) form_.Append(u"פינג תקין ל-" + address);
  if (status == platform::kEchoTimedOut) form_.Append(u"פינג ל-" + address + u" - Request Timed Out");
  if (status == platform::kEchoHostUnreachable)
    form_.Append(u"פינג ל-" + address + u" - Destination Host Unreachable");
  return status == platform::kEchoSuccess;
}

} // namespace quendra::provisioning

#include "diagnostics/mdlTracert.h"

#include "forms/MessageLoop.h"
#include "forms/controls/CommandButton.h"
#include "forms/controls/TextBox.h"
#include "foundation/Wording.h"
#include "platform/net/HostNames.h"
#include "platform/net/Sockets.h"
#include "runtime/ByteFields.h"

#include <array>

namespace quendra::diagnostics {

namespace {

constexpr int kFirstTtl = 2;
constexpr int kLastTtl = 255;
constexpr std::size_t kPayloadSize = 32;
constexpr std::size_t kReplyBufferSize = 295;
constexpr std::uint32_t kTimeLimit = 2400;
constexpr std::uint8_t kMostTimeouts = 10;
constexpr std::uint16_t kSocketVersion = 0x0101;
constexpr const char16_t* kLineBreak = u"\r\n";

void Append(forms::TextBox& box, TextView text) { box.Value = box.Value() + Text(text); }
void AppendLine(forms::TextBox& box, TextView text) { Append(box, kLineBreak + Text(text)); }

Text TimeText(std::uint32_t milliseconds) {
  if (milliseconds < 10) return u"<10 ms";
  if (milliseconds > 1200) return u">1200 ms";
  return DecimalText(milliseconds) + u" ms";
}

/// The first router behind this machine isn't listed, and the count begins behind it.
Text HopLine(int ttl, std::uint32_t milliseconds, const Text& hop) {
  return u"Hop #\t" + DecimalText(ttl - 1) + u"\t" + TimeText(milliseconds) + u"\t" + hop + kLineBreak;
}

} // namespace

void mdlTracert::Trace(const Text& host, forms::TextBox& resultBox) {
  if (network_.sockets.WSAStartup(kSocketVersion) == 0)
    TraceWithSockets(host, resultBox);
  else
    AppendLine(resultBox, u"Unable to initialize the Windows Sockets");
  frmSurf_cmdStart_.Caption = u"התחל";
  frmSurf_cmdStart_.Enabled = true;
}

void mdlTracert::TraceWithSockets(const Text& host, forms::TextBox& resultBox) {
  Route route{host, Resolve(host)};
  {
    IcmpFile file(network_.icmp);
    if (file.IsOpen())
      WalkRoute(file, route, resultBox);
    else
      ReportNoHandle(resultBox);
  }
  CleanUp();
  loop_.MessageBox(u"המעקב הסתיים. " + Text(kLineBreak) + u"האם לשלוח דו\"ח?",
                   forms::kYesNo | forms::kQuestion | forms::kHebrewBox, foundation::kTitle);
}

Text mdlTracert::Resolve(const Text& host) {
  const auto addresses = network_.hostNames.gethostbyname(ToCodePage(host) + '\0');
  return addresses ? addresses->front().AsText() : Text();
}

void mdlTracert::WalkRoute(IcmpFile& file, Route& route, forms::TextBox& resultBox) {
  resultBox.Value = u"Tracing to " + route.host + u" (" + route.ip + u")..." + kLineBreak;
  TraceTimeouts = 0;
  for (int ttl = kFirstTtl; ttl <= kLastTtl; ++ttl) {
    if (TryHop(file, ttl, route, resultBox)) {
      TraceTimeouts = 0;
    } else {
      ++TraceTimeouts;
      --ttl;
    }
    loop_.DoEvents();
    if (route.IsComplete()) return AppendLine(resultBox, u"Trace Route Complete");
    if (TraceTimeouts == kMostTimeouts) return AppendLine(resultBox, u"Request timed out!!!");
  }
}

bool mdlTracert::TryHop(IcmpFile& file, int ttl, Route& route, forms::TextBox& resultBox) {
  std::array<std::uint8_t, kPayloadSize> payload;
  payload.fill('a');
  std::array<std::uint8_t, platform::kEchoOptionsSize> options{};
  options[platform::kOptionsTtl] = static_cast<std::uint8_t>(ttl);
  std::array<std::uint8_t, kReplyBufferSize> reply{};
  const platform::Ipv4Address target = platform::Sockets::inet_addr(ToCodePage(route.ip));
  if (file.SendEcho({target, payload, options}, reply, kTimeLimit) != 1) return false;
  route.hop = platform::Ipv4Address::FromMemory(Little32(reply, platform::kReplyAddress)).AsText();
  Append(resultBox, HopLine(ttl, Little32(reply, platform::kReplyRoundTripTime), route.hop));
  return true;
}

/// Beside the report's own line it says what the user can do about it, where the system tells.
void mdlTracert::ReportNoHandle(forms::TextBox& resultBox) {
  AppendLine(resultBox, u"Unable to Open an Icmp File Handle");
  const std::string right = network_.icmp.MissingRight();
  if (!right.empty()) AppendLine(resultBox, u"אין הרשאה לשלוח מנות ICMP: חסרה " + FromCodePage(right));
}

void mdlTracert::CleanUp() {
  if (network_.sockets.WSACleanup() != 0)
    loop_.MessageBox(u"Windows Sockets error occurred during Cleanup.", forms::kExclamation, u"Quendra");
}

} // namespace quendra::diagnostics

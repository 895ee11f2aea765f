#pragma once

#include "diagnostics/IcmpFile.h"
#include "runtime/Text.h"

#include <cstdint>

namespace quendra::forms {
class CommandButton;
class MessageLoop;
class TextBox;
} // namespace quendra::forms

namespace quendra::platform {
class HostNames;
class Sockets;
} // namespace quendra::platform

namespace quendra::diagnostics {

/// Traces the route to a host, hop by hop, by echoes that may go one router further each time.
class mdlTracert {
 public:
  /// The machine's operations that a trace asks for.
  struct Network {
    platform::Sockets& sockets;
    platform::HostNames& hostNames;
    platform::Icmp& icmp;
  };
  mdlTracert(const Network& network, forms::MessageLoop& loop, forms::CommandButton& frmSurf_cmdStart)
      : network_(network), loop_(loop), frmSurf_cmdStart_(frmSurf_cmdStart) {}

  /// Runs a whole trace and returns at its end. The page may be left meanwhile: the report goes on in its
  /// box.
  void Trace(const Text& host, forms::TextBox& resultBox);

  /// Echoes without a reply since the last one with one.
  std::uint8_t TraceTimeouts = 0;

 private:
  /// Where a trace goes, and who answered last.
  struct Route {
    const Text& host;
    Text ip{};
    Text hop{};
    bool IsComplete() const { return hop == host || hop == ip; }
  };

  /// The first address of the host as a dotted text, empty when it has none.
  Text Resolve(const Text& host);
  void TraceWithSockets(const Text& host, forms::TextBox& resultBox);
  void WalkRoute(IcmpFile& file, Route& route, forms::TextBox& resultBox);
  /// Whether a reply came; then its sender is the route's hop and has its line.
  bool TryHop(IcmpFile& file, int ttl, Route& route, forms::TextBox& resultBox);
  void ReportNoHandle(forms::TextBox& resultBox);
  void CleanUp();

  Network network_;
  forms::MessageLoop& loop_;
  forms::CommandButton& frmSurf_cmdStart_;
};

} // namespace quendra::diagnostics

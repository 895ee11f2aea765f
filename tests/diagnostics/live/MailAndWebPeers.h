#pragma once

#include "report/live/Peer.h"

#include <memory>
#include <string>

namespace quendra::diagnostics {

/// Servers from the distribution as they serve subscribers: web, POP3 and SMTP, on loopback of the thread's
/// network namespace. All that they write is below a folder.
class MailAndWebPeers {
 public:
  /// Why they can't be started here; empty when they can.
  static std::string Missing();

  /// Starts them, and returns once their ports can be reached.
  explicit MailAndWebPeers(const std::string& folder);

  /// What each has noted about those who connected.
  std::string WebLog() const;
  std::string IncomingMailLog() const;
  std::string OutgoingMailLog() const;

 private:
  void StartWeb();
  void StartIncomingMail();
  void StartOutgoingMail();
  std::string Write(const std::string& name, const std::string& content) const;
  std::string Read(const std::string& name) const;

  const std::string folder_;
  std::unique_ptr<report::Peer> web_;
  std::unique_ptr<report::Peer> incomingMail_;
  std::unique_ptr<report::Peer> outgoingMail_;
};

} // namespace quendra::diagnostics

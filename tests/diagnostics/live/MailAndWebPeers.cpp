#include "diagnostics/live/MailAndWebPeers.h"

#include <filesystem>
#include <fstream>
#include <iterator>

namespace quendra::diagnostics {

using report::PathOfProgram;
using report::Peer;

namespace {

constexpr const char* kWebConfig = R"(
daemon off;
user root;
worker_processes 1;
pid FOLDER/web.pid;
error_log FOLDER/web-errors.log;
events { worker_connections 64; }
http {
  log_format probe '"$request" $status';
  access_log FOLDER/web.log probe;
  client_body_temp_path FOLDER/bodies;
  proxy_temp_path FOLDER/proxy;
  server { listen 127.0.0.1:80; location / { return 200 "hello"; } }
}
)";

constexpr const char* kIncomingMailConfig = R"(
base_dir = FOLDER/pop3
state_dir = FOLDER/pop3-state
log_path = FOLDER/pop3.log
protocols = pop3
listen = 127.0.0.1
login_greeting = ready
ssl = no
default_internal_user = root
default_internal_group = root
default_login_user = nobody
mail_location = maildir:FOLDER/mail
service pop3-login {
  chroot =
  inet_listener pop3s {
    port = 0
  }
}
service anvil {
  chroot =
}
passdb {
  driver = static
  args = nopassword=y
}
userdb {
  driver = static
  args = uid=nobody gid=nogroup home=FOLDER/mail
}
)";

constexpr const char* kOutgoingMailConfig = R"(
listen on 127.0.0.1 port 25 hostname mail.test
action "keep" maildir "FOLDER/mail"
match for local action "keep"
)";

std::string Filled(std::string text, const std::string& folder) {
  const std::string word = "FOLDER";
  for (std::size_t at = text.find(word); at != std::string::npos; at = text.find(word, at + folder.size()))
    text.replace(at, word.size(), folder);
  return text;
}

} // namespace

std::string MailAndWebPeers::Missing() {
  const std::string advice = " isn't installed; scripts/setup installs it where nothing else serves mail";
  for (const char* program : {"nginx", "dovecot", "smtpd"})
    if (PathOfProgram(program).empty()) return program + advice;
  // A machine may serve mail without this protocol.
  if (!std::filesystem::exists("/usr/lib/dovecot/pop3-login")) return "dovecot's pop3-login" + advice;
  return {};
}

MailAndWebPeers::MailAndWebPeers(const std::string& folder) : folder_(folder) {
  // They drop their rights and write here then.
  std::filesystem::permissions(folder_, std::filesystem::perms::all);
  StartWeb();
  StartIncomingMail();
  StartOutgoingMail();
  web_->AwaitPort(80);
  incomingMail_->AwaitPort(110);
  outgoingMail_->AwaitPort(25);
}

void MailAndWebPeers::StartWeb() {
  const std::string config = Write("web.conf", kWebConfig);
  web_ = std::make_unique<Peer>(
      std::vector<std::string>{"nginx", "-e", folder_ + "/web-errors.log", "-c", config});
}

void MailAndWebPeers::StartIncomingMail() {
  const std::string config = Write("pop3.conf", kIncomingMailConfig);
  incomingMail_ =
      std::make_unique<Peer>(std::vector<std::string>{PathOfProgram("dovecot"), "-F", "-c", config});
}

// It has its socket for commands and its queue at places of its own: there it finds folders that nobody else
// sees and that go with it, so that a server of the machine isn't disturbed.
void MailAndWebPeers::StartOutgoingMail() {
  const std::string config = Write("smtp.conf", kOutgoingMailConfig);
  const std::string command =
      "mount -t tmpfs tmpfs /run && mount -t tmpfs -o mode=711 tmpfs /var/spool/smtpd && exec " +
      PathOfProgram("smtpd") + " -d -T smtp -f " + config + " 2>" + folder_ + "/smtp.log";
  outgoingMail_ = std::make_unique<Peer>(std::vector<std::string>{"unshare", "--mount", "sh", "-c", command});
}

std::string MailAndWebPeers::WebLog() const { return Read("web.log"); }
std::string MailAndWebPeers::IncomingMailLog() const { return Read("pop3.log"); }
std::string MailAndWebPeers::OutgoingMailLog() const { return Read("smtp.log"); }

std::string MailAndWebPeers::Write(const std::string& name, const std::string& content) const {
  const std::string path = folder_ + "/" + name;
  std::ofstream(path) << Filled(content, folder_);
  return path;
}

std::string MailAndWebPeers::Read(const std::string& name) const {
  std::ifstream file(folder_ + "/" + name);
  return {std::istreambuf_iterator<char>(file), {}};
}

} // namespace quendra::diagnostics

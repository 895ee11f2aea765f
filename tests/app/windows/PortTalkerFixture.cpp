#include "app/windows/PortTalker.h"

#include <stdexcept>

namespace quendra::app::windows {

namespace {

constexpr int kMostTries = 40;

std::string Word(const Requests& requests) {
  return std::to_string(requests.count) + "x" + std::to_string(requests.request) + ":" +
         std::to_string(requests.reply);
}

} // namespace

NamedEvent::NamedEvent(const std::string& name, bool isForMany)
    : event_(::CreateEventA(nullptr, isForMany, FALSE, ("Local\\quendra-talk-" + name).c_str())) {}

PortTalker PortTalker::Server(FreePorts& ports, const std::string& address, const Requests& requests) {
  return OnFreePort(
      "serve", address, [&] { return ports.highest--; }, Word(requests));
}

PortTalker PortTalker::Caller(FreePorts& ports, const std::string& address, const Requests& requests,
                              const std::string& server, unsigned serverPort) {
  const std::string peer = server + " " + std::to_string(serverPort);
  return OnFreePort(
      "call", address, [&] { return ports.lowest++; }, Word(requests) + " " + peer);
}

PortTalker PortTalker::OnFreePort(const char* role, const std::string& address,
                                  const std::function<unsigned()>& next, const std::string& words) {
  for (int tried = 0; tried < kMostTries; ++tried) {
    PortTalker talker(role, address, next(), words);
    if (Until([&] { return talker.told_->IsSet() || !talker.program_->Runs(); }) && talker.program_->Runs())
      return talker;
  }
  throw std::runtime_error("no port to " + std::string(role) + " at " + address);
}

PortTalker::PortTalker(const char* role, const std::string& address, unsigned port, const std::string& words)
    : port_(port), end_(address + ":" + std::to_string(port)),
      told_(std::make_unique<NamedEvent>(std::to_string(port))),
      program_(std::make_unique<StartedProgram>(
          FolderOfBuild() + u"\\port_talker.exe", Text(),
          FromUtf8(role + (" " + address) + " " + std::to_string(port) + " " + words))) {}

} // namespace quendra::app::windows

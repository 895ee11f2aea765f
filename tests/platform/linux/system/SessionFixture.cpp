#include "platform/linux/system/SessionFixture.h"

#include "platform/linux/system/Descriptor.h"
#include "platform/linux/system/Files.h"

#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>

namespace quendra::platform::linux_ {

namespace {

/// A bus that knows no services but the test's own, and lets everybody say everything.
constexpr const char* kBus = R"(<busconfig><type>session</type><listen>unix:path=%/bus</listen>
<servicedir>%/services</servicedir><policy context="default"><allow send_destination="*"/>
<allow receive_sender="*"/><allow own="*"/></policy></busconfig>)";

std::string InFolder(std::string text, const std::string& folder) {
  for (auto at = text.find('%'); at != std::string::npos; at = text.find('%', at + folder.size()))
    text.replace(at, 1, folder);
  return text;
}

bool LetsConnect(const std::string& path) {
  const Descriptor client(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  path.copy(address.sun_path, sizeof address.sun_path - 1);
  return ::connect(client.Number(), reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0;
}

/// A stand-in takes its time to start on a machine that is busy.
bool WaitLong(const std::function<bool()>& done) {
  for (int i = 0; i < 10; ++i)
    if (Wait(done)) return true;
  return false;
}

} // namespace

SessionTest::SessionTest() {
  environment.Set("PATH", folder / "programs");
  environment.Set("DBUS_SESSION_BUS_ADDRESS", "unix:path=" + (folder / "bus"));
  for (const char* name : {"DISPLAY", "XDG_SESSION_TYPE", "XDG_CURRENT_DESKTOP"}) environment.Set(name, {});
}

void SessionTest::AddProgram(const std::string& name) {
  const std::string path = folder / "programs/" + name;
  folder.Write("programs/" + name,
               "#!/bin/sh\necho \"$*\" > " + path + ".part\n/bin/mv " + path + ".part " + path + ".given\n",
               true);
}

std::string SessionTest::GivenTo(const std::string& name) {
  std::optional<std::string> given;
  WaitLong([&] { return (given = ReadFile(folder / "programs/" + name + ".given", 10'000)).has_value(); });
  return given.value_or("not started");
}

bool SessionTest::WasStarted(const std::string& name) {
  return Wait([&] { return ReadFile(folder / "programs/" + name + ".given", 10'000).has_value(); });
}

void SessionTest::StartBus() {
  ::mkdir((folder / "services").c_str(), 0755);
  const std::string configuration = folder.Write("bus.conf", InFolder(kBus, folder.Path()));
  bus_ = std::make_unique<Child>(std::vector<std::string>{
      "/bin/sh", "-c",
      "exec /usr/bin/dbus-daemon --nofork --nopidfile 2>/dev/null --config-file=" + configuration});
  ASSERT_TRUE(WaitLong([&] { return LetsConnect(folder / "bus"); })) << "the bus doesn't start";
}

std::string SessionTest::StandIn(const std::string& arguments) {
  return QUENDRA_SOURCE_DIR "/tests/standins/session_service.py " + Log() + " " + arguments;
}

void SessionTest::StartService(const std::string& arguments) {
  services_.push_back(std::make_unique<Child>(
      std::vector<std::string>{"/bin/sh", "-c", "exec /usr/bin/python3 " + StandIn(arguments)}));
  ASSERT_TRUE(WaitLong([&] { return ReadFile(Log(), 1000) == "ready\n"; })) << "the service doesn't start";
}

void SessionTest::AddService(const std::string& name, const std::string& arguments) {
  folder.Write("services/" + name + ".service",
               "[D-BUS Service]\nName=" + name + "\nExec=/usr/bin/python3 " + StandIn(arguments) + "\n");
}

std::string SessionTest::Asked() {
  const std::string log = ReadFile(Log(), 10'000).value_or("");
  return log.starts_with("ready\n") ? log.substr(6) : log;
}

} // namespace quendra::platform::linux_

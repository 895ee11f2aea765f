#include "platform/linux/network_manager/PrivateBusFixture.h"

#include "platform/linux/system/Descriptor.h"
#include "platform/linux/system/Files.h"

#include <signal.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>

#include <array>
#include <cstdio>

namespace quendra::platform::linux_ {

namespace {

constexpr const char* kBus = R"(<busconfig><type>system</type><listen>unix:path=%/bus</listen>
<auth>EXTERNAL</auth><policy context="default"><allow user="*"/><allow send_destination="*"/>
<allow receive_sender="*"/><allow own="*"/></policy></busconfig>)";

constexpr const char* kManager = R"([main]
auth-polkit=false
plugins=keyfile
dhcp=internal
no-auto-default=*
dns=none
rc-manager=unmanaged
[keyfile]
path=%/connections
[connectivity]
enabled=false
)";

/// It waits for a device manager where /sys can be written, so it sees one that can't.
constexpr const char* kScript = R"(set -e
mount --make-rprivate /
mount -t sysfs -o ro sysfs /sys
mount -t tmpfs tmpfs /run
mount --bind %/state /var/lib/NetworkManager
ip link set lo up
)";

std::string Filled(std::string text, const std::string& folder) {
  for (auto at = text.find('%'); at != std::string::npos; at = text.find('%', at + folder.size()))
    text.replace(at, 1, folder);
  return text;
}

bool LetsConnectTo(const std::string& path) {
  const Descriptor client(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  path.copy(address.sun_path, sizeof address.sun_path - 1);
  return ::connect(client.Number(), reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0;
}

bool WaitTenTimes(const std::function<bool()>& done) {
  for (int i = 0; i < 10; ++i)
    if (Wait(done)) return true;
  return false;
}

} // namespace

std::string OutputOf(const std::string& command) {
  std::string text;
  FILE* pipe = ::popen((command + " 2>&1").c_str(), "re");
  if (!pipe) return "not started";
  std::array<char, 4096> buffer;
  for (std::size_t count = 0; (count = std::fread(buffer.data(), 1, buffer.size(), pipe)) > 0;)
    text.append(buffer.data(), count);
  ::pclose(pipe);
  return text;
}

PrivateBus::PrivateBus() { environment.Set("DBUS_SYSTEM_BUS_ADDRESS", Address()); }

bool PrivateBus::Start() {
  const std::string configuration = folder.Write("bus.conf", Filled(kBus, folder.Path()));
  ::unlink((folder / "bus").c_str());
  bus_ = std::make_unique<Child>(std::vector<std::string>{
      "/bin/sh", "-c",
      "exec /usr/bin/dbus-daemon --nofork --nopidfile 2>/dev/null --config-file=" + configuration});
  return WaitTenTimes([&] { return LetsConnectTo(folder / "bus"); });
}

std::string RealNetworkManager::Missing() {
  if (::geteuid() != 0) return "needs root for namespaces";
  if (!RunShell("command -v NetworkManager nmcli pppd dbus-daemon >/dev/null"))
    return "NetworkManager isn't installed; scripts/setup installs it";
  return {};
}

RealNetworkManager::RealNetworkManager(std::string links) {
  for (const char* name : {"connections", "state", "conf.d"}) ::mkdir((bus.folder / name).c_str(), 0700);
  bus.folder.Write("manager.conf", Filled(kManager, bus.folder.Path()));
  bus.folder.Write("start", Filled(kScript, bus.folder.Path()) + links +
                                Filled("\nexec NetworkManager --no-daemon --config %/manager.conf "
                                       "--config-dir %/conf.d >>%/log 2>&1\n",
                                       bus.folder.Path()));
}

bool RealNetworkManager::Start() {
  if (!LetsConnectTo(bus.folder / "bus") && !bus.Start()) return false;
  manager_ = std::make_unique<Child>(
      std::vector<std::string>{"/bin/sh", "-c", "exec unshare -n -m /bin/sh " + (bus.folder / "start")});
  return WaitTenTimes([&] { return Nmcli("-t -f STARTUP general") == "started\n"; });
}

void RealNetworkManager::StopForAWhile() const { ::kill(manager_->Id(), SIGSTOP); }
void RealNetworkManager::GoOn() const { ::kill(manager_->Id(), SIGCONT); }

std::string RealNetworkManager::Nmcli(const std::string& arguments) const {
  return OutputOf("timeout 20 nmcli " + arguments);
}

std::string RealNetworkManager::NmcliWith(const std::string& text, const std::string& arguments) const {
  std::string shown = Nmcli(arguments);
  for (int i = 0; i < 10 && shown.find(text) == std::string::npos; ++i) shown = Nmcli(arguments);
  return shown;
}

std::string RealNetworkManager::InItsNetwork(const std::string& command) const {
  return OutputOf("nsenter -t " + std::to_string(manager_->Id()) + " -n " + command);
}

std::string RealNetworkManager::Log() const { return ReadFile(bus.folder / "log", 10'000'000).value_or(""); }

} // namespace quendra::platform::linux_

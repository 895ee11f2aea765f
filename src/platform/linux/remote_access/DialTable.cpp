#include "platform/linux/remote_access/DialTable.h"

#include "platform/linux/network_manager/NetworkManagerNames.h"
#include "platform/remote_access/RemoteAccessNumbers.h"

#include <algorithm>
#include <array>

namespace quendra::platform::linux_ {

namespace {

/// A state or reason of NetworkManager's and the number that it becomes. Behind each stands where
/// NetworkManager publishes it: the enumeration of its D-Bus API, and what that says of it.
struct Meaning {
  std::uint64_t theirs;
  std::uint32_t ours;
};

constexpr std::array kDeviceStates{
    Meaning{nm::kPrepare, kRasPortOpened},        // NMDeviceState: preparing the connection
    Meaning{nm::kConfig, kRasConnectDevice},      // connecting to the requested network
    Meaning{nm::kIpConfig, kRasAuthenticated},    // requesting addresses, which follows PPP
    Meaning{nm::kIpCheck, kRasProjected},         // checking whether further action is required
    Meaning{nm::kSecondaries, kRasProjected},     // waiting for a secondary connection
    Meaning{nm::kDeviceActivated, kRasConnected}, // the device has a connection
};

constexpr std::array kVpnStates{
    Meaning{nm::kVpnPrepare, kRasPortOpened},    // NMVpnConnectionState: preparing to connect
    Meaning{nm::kVpnConnect, kRasConnectDevice}, // the connection attempt is ongoing
    Meaning{nm::kVpnIpConfig, kRasAuthenticate}, // getting an address: the plugin's PPP runs in this state
    Meaning{nm::kVpnActivated, kRasConnected},   // the VPN is active
};

constexpr std::array kDeviceReasons{
    Meaning{3, kRasPortNotAvailable},      // NMDeviceStateReason: the device is no longer managed
    Meaning{4, kRasPppNotConverging},      // the device could not be readied for configuration
    Meaning{5, kRasPppNotConverging},      // no IP configuration
    Meaning{6, kRasPppNotConverging},      // IP configuration expired
    Meaning{7, kRasAuthenticationFailure}, // secrets were required, but not provided
    Meaning{12, kRasPortNotAvailable},     // the PPP service failed to start
    Meaning{
        13,
        kRasAuthenticationFailure}, // the PPP service disconnected: the far end, which had answered, ended it
    Meaning{35, kRasPortNotAvailable},  // necessary firmware is missing
    Meaning{36, kRasPortNotAvailable},  // the device was removed
    Meaning{37, kRasUserDisconnection}, // NetworkManager went to sleep
    Meaning{38, kRasUserDisconnection}, // the connection was removed or disappeared
    Meaning{39, kRasUserDisconnection}, // disconnected by user or client
    Meaning{40, kRasNoAnswer},          // the carrier or link changed
    Meaning{60, kRasUserDisconnection}, // a new activation was enqueued
};
/// NMDeviceState: unmanaged, unavailable, disconnected, deactivating, failed.
constexpr std::array<std::uint64_t, 5> kEnds{nm::kUnmanaged, nm::kUnavailable, nm::kDeviceDisconnected,
                                             nm::kDeactivating, nm::kDeviceFailed};

/// NMDeviceStateReason: PPP failed.
constexpr std::uint64_t kPppFailed = 14;

constexpr std::array kActiveReasons{
    Meaning{2, kRasUserDisconnection},      // NMActiveConnectionStateReason: the user disconnected
    Meaning{3, kRasPortDisconnected},       // the device that it used was disconnected
    Meaning{4, kRasNoAnswer},               // the service that provides the VPN was stopped
    Meaning{5, kRasPppNotConverging},       // the IP configuration was invalid
    Meaning{6, kRasNoAnswer},               // the connection attempt timed out
    Meaning{7, kRasPortNotAvailable},       // starting the service timed out
    Meaning{8, kRasPortNotAvailable},       // starting the service failed
    Meaning{9, kRasAuthenticationFailure},  // necessary secrets were not provided
    Meaning{10, kRasAuthenticationFailure}, // authentication to the server failed
    Meaning{11, kRasUserDisconnection},     // the connection was deleted
    Meaning{12, kRasPortNotAvailable},      // a connection that it depends on failed
    Meaning{13, kRasPortNotAvailable},      // the device could not be made
    Meaning{14, kRasPortNotAvailable},      // the device disappeared
};

template <typename Table> std::optional<std::uint32_t> Look(const Table& table, std::uint64_t theirs) {
  const auto found = std::ranges::find(table, theirs, &Meaning::theirs);
  return found == table.end() ? std::nullopt : std::optional(found->ours);
}

} // namespace

std::optional<std::uint32_t> RasStateOfDevice(std::uint64_t deviceState) {
  return Look(kDeviceStates, deviceState);
}

std::optional<std::uint32_t> RasStateOfVpn(std::uint64_t vpnState) { return Look(kVpnStates, vpnState); }

bool EndsLine(std::uint64_t deviceState) { return std::ranges::find(kEnds, deviceState) != kEnds.end(); }

std::uint32_t RasErrorOfDevice(std::uint64_t reason, KernelPpp kernel) {
  if (reason == kPppFailed && kernel == KernelPpp::Missing) return kRasPortNotAvailable;
  return Look(kDeviceReasons, reason).value_or(kRasNoAnswer);
}

std::uint32_t RasErrorOfActive(std::uint64_t reason, KernelPpp kernel) {
  const std::uint32_t error = Look(kActiveReasons, reason).value_or(kRasNoAnswer);
  return error == kRasNoAnswer && kernel == KernelPpp::Missing ? std::uint32_t{kRasPortNotAvailable} : error;
}

std::uint32_t RasErrorOfDrop(std::uint32_t errorOfDial) {
  const bool isWanted = errorOfDial == kRasUserDisconnection || errorOfDial == kRasManagerCannotStart;
  return isWanted ? errorOfDial : std::uint32_t{kRasPortDisconnected};
}

} // namespace quendra::platform::linux_

#pragma once

#include <cstdint>

/// NetworkManager's own names and numbers, from its published interface (NetworkManager.io, "D-Bus API").
namespace quendra::platform::linux_::nm {

inline constexpr const char* kService = "org.freedesktop.NetworkManager";
inline constexpr const char* kProperties = "org.freedesktop.DBus.Properties";

inline constexpr const char* kManagerPath = "/org/freedesktop/NetworkManager";
inline constexpr const char* kManager = "org.freedesktop.NetworkManager";
inline constexpr const char* kSettingsPath = "/org/freedesktop/NetworkManager/Settings";
inline constexpr const char* kSettings = "org.freedesktop.NetworkManager.Settings";
inline constexpr const char* kConnection = "org.freedesktop.NetworkManager.Settings.Connection";
inline constexpr const char* kActive = "org.freedesktop.NetworkManager.Connection.Active";
inline constexpr const char* kVpnActive = "org.freedesktop.NetworkManager.VPN.Connection";
inline constexpr const char* kDevice = "org.freedesktop.NetworkManager.Device";
inline constexpr const char* kIp4Config = "org.freedesktop.NetworkManager.IP4Config";

/// What stands for an object that isn't there.
inline constexpr const char* kNoObject = "/";
inline constexpr const char* kPptpService = "org.freedesktop.NetworkManager.pptp";

/// NMDeviceType.
enum DeviceType : std::uint32_t { kEthernet = 1, kWifi = 2, kVeth = 20, kLoopback = 32 };

/// NMDeviceState.
enum DeviceState : std::uint32_t {
  kUnmanaged = 10,
  kUnavailable = 20,
  kDeviceDisconnected = 30,
  kPrepare = 40,
  kConfig = 50,
  kNeedAuth = 60,
  kIpConfig = 70,
  kIpCheck = 80,
  kSecondaries = 90,
  kDeviceActivated = 100,
  kDeactivating = 110,
  kDeviceFailed = 120,
};

/// NMActiveConnectionState.
enum ActiveState : std::uint32_t {
  kActivating = 1,
  kActivated = 2,
  kActiveDeactivating = 3,
  kDeactivated = 4,
};

/// NMVpnConnectionState.
enum VpnState : std::uint32_t {
  kVpnPrepare = 1,
  kVpnNeedAuth = 2,
  kVpnConnect = 3,
  kVpnIpConfig = 4,
  kVpnActivated = 5,
  kVpnFailed = 6,
  kVpnDisconnected = 7,
};

} // namespace quendra::platform::linux_::nm

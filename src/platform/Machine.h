#pragma once

namespace quendra::platform {

class CaptureControls;
class CaptureLibrary;
class Handles;
class HostNames;
class Icmp;
class Icons;
class IpHelper;
class KeyboardLayout;
class PerformanceData;
class Processes;
class Registry;
class ShellStart;
class Sockets;
class System;
class Tokens;
class UrlCache;
class VersionInfo;

/// All that the program asks of a machine, by family.
struct Machine {
  CaptureControls& captureControls;
  CaptureLibrary& captureLibrary;
  Handles& handles;
  HostNames& hostNames;
  Icmp& icmp;
  Icons& icons;
  IpHelper& ipHelper;
  KeyboardLayout& keyboardLayout;
  PerformanceData& performanceData;
  Processes& processes;
  Registry& registry;
  ShellStart& shellStart;
  Sockets& sockets;
  System& system;
  Tokens& tokens;
  UrlCache& urlCache;
  VersionInfo& versionInfo;
};

} // namespace quendra::platform

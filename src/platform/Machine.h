#pragma once

namespace quendra::platform {

class Adapters;
class CaptureControls;
class CaptureLibrary;
class Dialling;
class Files;
class Handles;
class HostNames;
class Icmp;
class Icons;
class InstalledProducts;
class IpHelper;
class KeyboardLayout;
class PerformanceData;
class PhoneBook;
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
  Adapters& adapters;
  CaptureControls& captureControls;
  CaptureLibrary& captureLibrary;
  Dialling& dialling;
  Files& files;
  Handles& handles;
  HostNames& hostNames;
  Icmp& icmp;
  Icons& icons;
  InstalledProducts& installedProducts;
  IpHelper& ipHelper;
  KeyboardLayout& keyboardLayout;
  PerformanceData& performanceData;
  PhoneBook& phoneBook;
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

#pragma once

#include "runtime/OpaqueHandle.h"

#include <cstddef>
#include <cstdint>

namespace quendra::platform {

/// An open connection. 0 is none.
using RasConnection = OpaqueHandle<struct RasConnectionKind>;
inline constexpr RasConnection kNoRasConnection;

/// What remote access calls its own numbers of failure; those below 600 are the system's.
enum RasErrorNumber : std::uint32_t {
  kRasSuccess = 0,
  kRasInvalidPortHandle = 601,
  kRasBufferTooSmall = 603,
  kRasBufferInvalid = 610,
  kRasCannotFindPhonebookEntry = 623,
  kRasPortDisconnected = 628,
  kRasUserDisconnection = 631,
  kRasInvalidSize = 632,
  kRasPortNotAvailable = 633,
  kRasNoAnswer = 678,
  kRasAuthenticationFailure = 691,
  kRasManagerCannotStart = 711,
  kRasPppTimeout = 718,
  kRasPppNotConverging = 720,
};

/// States of a connection that is being dialled, as far as the program or a backend names them.
enum RasConnectionState : std::uint32_t {
  kRasOpenPort = 0,
  kRasPortOpened = 1,
  kRasConnectDevice = 2,
  kRasDeviceConnected = 3,
  kRasAllDevicesConnected = 4,
  kRasAuthenticate = 5,
  kRasAuthNotify = 6,
  kRasAuthenticated = 14,
  kRasProjected = 18,
  kRasConnected = 8192,
  kRasDisconnected = 8193,
};

/// The kind of notifier that is a window.
inline constexpr std::uint32_t kRasNotifierIsWindow = 0xFFFFFFFF;
/// The message that tells a window of a dial: the state is its wParam, the error number its lParam. It is
/// registered under this name; the number stands for it where it can't be registered.
inline constexpr const char* kRasDialEventName = "RasDialEvent";
inline constexpr std::uint32_t kRasDialEvent = 0xCCCD;

/// A record without its texts at the end may be longer on later systems.
struct RasEntryName {
  static constexpr std::uint32_t kBytes = 264;
  static constexpr std::size_t kName = 4;
  static constexpr std::size_t kNameBytes = 257;
};
struct RasDeviceInfo {
  static constexpr std::uint32_t kBytes = 152;
  static constexpr std::size_t kType = 4;
  static constexpr std::size_t kTypeBytes = 17;
  static constexpr std::size_t kName = 21;
  static constexpr std::size_t kNameBytes = 129;
};
struct RasDialExtensions {
  static constexpr std::uint32_t kBytes = 16;
};
/// RASDIALPARAMS: every text follows the one before, the entry's name begins at 4.
struct RasDialParams {
  static constexpr std::uint32_t kBytes = 1060;
  static constexpr std::uint32_t kBytesWithoutNumbers = 1052;
  static constexpr std::uint32_t kBytesOfShortNames = 816;
  static constexpr std::size_t kEntryName = 4;
  static constexpr std::size_t kEntryNameBytes = 257;
  static constexpr std::size_t kShortEntryNameBytes = 21;
  static constexpr std::size_t kPhoneNumberBytes = 129;
  static constexpr std::size_t kCallbackNumberBytes = 129;
  static constexpr std::size_t kUserNameBytes = 257;
  static constexpr std::size_t kPasswordBytes = 257;
  static constexpr std::size_t kDomainBytes = 16;
  static constexpr std::size_t kSubEntry = 1052;
  static constexpr std::size_t kCallbackId = 1056;
};
/// RASCONN in the sizes that systems have had.
struct RasConnectionRecord {
  static constexpr std::uint32_t kBytes = 692;
  static constexpr std::uint32_t kBytesWithoutGuid = 676;
  static constexpr std::uint32_t kBytesWithoutPhoneBook = 412;
  static constexpr std::uint32_t kBytesOfShortNames = 32;
  static constexpr std::size_t kHandle = 4;
  static constexpr std::size_t kEntryName = 8;
  static constexpr std::size_t kEntryNameBytes = 257;
  static constexpr std::size_t kShortEntryNameBytes = 21;
  static constexpr std::size_t kDeviceType = 265;
  static constexpr std::size_t kDeviceTypeBytes = 17;
  static constexpr std::size_t kDeviceName = 282;
  static constexpr std::size_t kDeviceNameBytes = 129;
  static constexpr std::size_t kPhoneBook = 411;
  static constexpr std::size_t kPhoneBookBytes = 260;
  static constexpr std::size_t kSubEntry = 672;
  static constexpr std::size_t kGuid = 676;
};
/// RASENTRY, where every system has it. What lies behind the device name moves with that name's width.
struct RasEntry {
  static constexpr std::uint32_t kBytes = 2088;
  static constexpr std::uint32_t kBytesWithoutEntryType = 1796;
  static constexpr std::uint32_t kBytesWithoutSubEntries = 1768;
  static constexpr std::uint32_t kBytesOfShortDeviceNames = 1672;
  static constexpr std::size_t kOptions = 4;
  static constexpr std::size_t kCountryId = 8;
  static constexpr std::size_t kCountryCode = 12;
  static constexpr std::size_t kAreaCode = 16;
  static constexpr std::size_t kAreaCodeBytes = 11;
  static constexpr std::size_t kLocalPhoneNumber = 27;
  static constexpr std::size_t kLocalPhoneNumberBytes = 129;
  static constexpr std::size_t kAlternateOffset = 156;
  static constexpr std::size_t kAddresses = 160; ///< five of four bytes
  static constexpr std::size_t kFrameSize = 180;
  static constexpr std::size_t kNetProtocols = 184;
  static constexpr std::size_t kFramingProtocol = 188;
  static constexpr std::size_t kScript = 192;
  static constexpr std::size_t kPathBytes = 260;
  static constexpr std::size_t kAutodialLibrary = 452;
  static constexpr std::size_t kAutodialFunction = 712;
  static constexpr std::size_t kDeviceType = 972;
  static constexpr std::size_t kDeviceTypeBytes = 17;
  static constexpr std::size_t kDeviceName = 989;
  static constexpr std::size_t kDeviceNameBytes = 129;
  static constexpr std::size_t kShortDeviceNameBytes = 33;
  static constexpr std::size_t kPadTypeBytes = 33;
  static constexpr std::size_t kX25TextBytes = 201; ///< address, facilities, user data
  static constexpr std::size_t kChannelsFromUserData = 203;
  static constexpr std::size_t kSubEntries = 1768;
  static constexpr std::size_t kDialMode = 1772;
  static constexpr std::size_t kDialExtraPercent = 1776;
  static constexpr std::size_t kDialExtraSampleSeconds = 1780;
  static constexpr std::size_t kHangUpExtraPercent = 1784;
  static constexpr std::size_t kHangUpExtraSampleSeconds = 1788;
  static constexpr std::size_t kIdleDisconnectSeconds = 1792;
  static constexpr std::size_t kEntryType = 1796;
  static constexpr std::size_t kEncryptionType = 1800;
  static constexpr std::size_t kCustomAuthKey = 1804;
  static constexpr std::size_t kGuid = 1808;
  static constexpr std::size_t kGuidBytes = 16;
  static constexpr std::size_t kCustomDialLibrary = 1824;
  static constexpr std::size_t kVpnStrategy = 2084;
};

} // namespace quendra::platform

#pragma once

#include "platform/Machine.h"
#include "platform/unavailable/UnavailableAdapters.h"
#include "platform/unavailable/UnavailableCaptureControls.h"
#include "platform/unavailable/UnavailableCaptureLibrary.h"
#include "platform/unavailable/UnavailableDialling.h"
#include "platform/unavailable/UnavailableFiles.h"
#include "platform/unavailable/UnavailableHandles.h"
#include "platform/unavailable/UnavailableHostNames.h"
#include "platform/unavailable/UnavailableIcmp.h"
#include "platform/unavailable/UnavailableIcons.h"
#include "platform/unavailable/UnavailableInstalledProducts.h"
#include "platform/unavailable/UnavailableIpHelper.h"
#include "platform/unavailable/UnavailableKeyboardLayout.h"
#include "platform/unavailable/UnavailablePerformanceData.h"
#include "platform/unavailable/UnavailablePhoneBook.h"
#include "platform/unavailable/UnavailableProcesses.h"
#include "platform/unavailable/UnavailableRegistry.h"
#include "platform/unavailable/UnavailableShellStart.h"
#include "platform/unavailable/UnavailableSockets.h"
#include "platform/unavailable/UnavailableSystem.h"
#include "platform/unavailable/UnavailableTokens.h"
#include "platform/unavailable/UnavailableUrlCache.h"
#include "platform/unavailable/UnavailableVersionInfo.h"

namespace quendra::platform::unavailable {

/// A machine that lacks every family of operations. A new system starts from it and replaces one family after
/// the other.
class UnavailableMachine {
 public:
  UnavailableMachine() = default;
  UnavailableMachine(const UnavailableMachine&) = delete;

  Machine Operations() {
    return {
        adapters,   captureControls, captureLibrary,    dialling, files,          handles,         hostNames,
        icmp,       icons,           installedProducts, ipHelper, keyboardLayout, performanceData, phoneBook,
        processes,  registry,        shellStart,        sockets,  system,         tokens,          urlCache,
        versionInfo};
  }

  UnavailableAdapters adapters;
  UnavailableDialling dialling;
  UnavailableFiles files;
  UnavailableInstalledProducts installedProducts;
  UnavailablePhoneBook phoneBook;
  UnavailableCaptureControls captureControls;
  UnavailableCaptureLibrary captureLibrary;
  UnavailableHandles handles;
  UnavailableHostNames hostNames;
  UnavailableIcmp icmp;
  UnavailableIcons icons;
  UnavailableIpHelper ipHelper;
  UnavailablePerformanceData performanceData;
  UnavailableKeyboardLayout keyboardLayout;
  UnavailableProcesses processes;
  UnavailableRegistry registry;
  UnavailableShellStart shellStart;
  UnavailableSockets sockets;
  UnavailableSystem system;
  UnavailableTokens tokens;
  UnavailableUrlCache urlCache;
  UnavailableVersionInfo versionInfo;
};

} // namespace quendra::platform::unavailable

#include "platform/windows/WindowsMachine.h"

#include "platform/unavailable/UnavailableCaptureControls.h"
#include "platform/unavailable/UnavailableCaptureLibrary.h"
#include "platform/unavailable/UnavailableHostNames.h"
#include "platform/unavailable/UnavailableIcmp.h"
#include "platform/unavailable/UnavailableIpHelper.h"
#include "platform/unavailable/UnavailableSockets.h"
#include "platform/windows/adapters/WindowsAdapters.h"
#include "platform/windows/files/WindowsFiles.h"
#include "platform/windows/internet/WindowsUrlCache.h"
#include "platform/windows/keyboard/WindowsKeyboardLayout.h"
#include "platform/windows/mail/WindowsInstalledProducts.h"
#include "platform/windows/process/WindowsHandles.h"
#include "platform/windows/process/WindowsIcons.h"
#include "platform/windows/process/WindowsProcesses.h"
#include "platform/windows/process/WindowsTokens.h"
#include "platform/windows/process/WindowsVersionInfo.h"
#include "platform/windows/registry/WindowsRegistry.h"
#include "platform/windows/remote_access/WindowsDialling.h"
#include "platform/windows/remote_access/WindowsPhoneBook.h"
#include "platform/windows/system/WindowsPerformanceData.h"
#include "platform/windows/system/WindowsShellStart.h"
#include "platform/windows/system/WindowsSystem.h"

namespace quendra::platform::windows {

struct WindowsMachine::Parts {
  explicit Parts(EventLoop& loop) : dialling(ras, loop) {}

  LastError lastError;
  RasCalls ras;

  WindowsAdapters adapters;
  unavailable::UnavailableCaptureControls captureControls;
  unavailable::UnavailableCaptureLibrary captureLibrary;
  WindowsDialling dialling;
  WindowsFiles files;
  WindowsHandles handles{lastError};
  unavailable::UnavailableHostNames hostNames;
  unavailable::UnavailableIcmp icmp;
  WindowsIcons icons;
  WindowsInstalledProducts installedProducts;
  unavailable::UnavailableIpHelper ipHelper;
  WindowsKeyboardLayout keyboardLayout;
  WindowsPerformanceData performanceData;
  WindowsPhoneBook phoneBook{ras};
  WindowsProcesses processes{lastError};
  WindowsRegistry registry;
  WindowsShellStart shellStart;
  unavailable::UnavailableSockets sockets;
  WindowsSystem system;
  WindowsTokens tokens{lastError};
  WindowsUrlCache urlCache;
  WindowsVersionInfo versionInfo;
};

WindowsMachine::WindowsMachine(EventLoop& loop) : parts_(std::make_unique<Parts>(loop)) {}

WindowsMachine::~WindowsMachine() = default;

Machine WindowsMachine::Operations() {
  Parts& own = *parts_;
  return {own.adapters,        own.captureControls,   own.captureLibrary, own.dialling,
          own.files,           own.handles,           own.hostNames,      own.icmp,
          own.icons,           own.installedProducts, own.ipHelper,       own.keyboardLayout,
          own.performanceData, own.phoneBook,         own.processes,      own.registry,
          own.shellStart,      own.sockets,           own.system,         own.tokens,
          own.urlCache,        own.versionInfo};
}

} // namespace quendra::platform::windows

#include "platform/windows/WindowsMachine.h"

#include "platform/windows/adapters/WindowsAdapters.h"
#include "platform/windows/capture/WindowsCapture.h"
#include "platform/windows/files/WindowsFiles.h"
#include "platform/windows/icmp/WindowsIcmp.h"
#include "platform/windows/internet/WindowsUrlCache.h"
#include "platform/windows/keyboard/WindowsKeyboardLayout.h"
#include "platform/windows/mail/WindowsInstalledProducts.h"
#include "platform/windows/net/WindowsHostNames.h"
#include "platform/windows/net/WindowsIpHelper.h"
#include "platform/windows/net/WindowsSockets.h"
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
  explicit Parts(EventLoop& loop)
      : capture(loop, ipHelperLibrary), dialling(ras, loop), sockets(loop, socketLibrary) {}

  LastError lastError;
  const IpHelperLibrary ipHelperLibrary;
  RasCalls ras;
  const SocketLibrary socketLibrary;

  WindowsAdapters adapters;
  WindowsCapture capture;
  WindowsDialling dialling;
  WindowsFiles files;
  WindowsHandles handles{lastError};
  WindowsHostNames hostNames{socketLibrary};
  WindowsIcmp icmp;
  WindowsIcons icons;
  WindowsInstalledProducts installedProducts;
  WindowsIpHelper ipHelper{ipHelperLibrary};
  WindowsKeyboardLayout keyboardLayout;
  WindowsPerformanceData performanceData;
  WindowsPhoneBook phoneBook{ras};
  WindowsProcesses processes{lastError};
  WindowsRegistry registry;
  WindowsShellStart shellStart;
  WindowsSockets sockets;
  WindowsSystem system;
  WindowsTokens tokens{lastError};
  WindowsUrlCache urlCache;
  WindowsVersionInfo versionInfo;
};

WindowsMachine::WindowsMachine(EventLoop& loop) : parts_(std::make_unique<Parts>(loop)) {}

WindowsMachine::~WindowsMachine() = default;

Machine WindowsMachine::Operations() {
  Parts& own = *parts_;
  return {own.adapters,        own.capture,           own.capture,   own.dialling,
          own.files,           own.handles,           own.hostNames, own.icmp,
          own.icons,           own.installedProducts, own.ipHelper,  own.keyboardLayout,
          own.performanceData, own.phoneBook,         own.processes, own.registry,
          own.shellStart,      own.sockets,           own.system,    own.tokens,
          own.urlCache,        own.versionInfo};
}

} // namespace quendra::platform::windows

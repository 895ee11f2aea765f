#include "platform/linux/LinuxMachine.h"
#include "platform/unavailable/UnavailableInstalledProducts.h"

#include "platform/linux/adapters/LinuxAdapters.h"
#include "platform/linux/capture/LinuxCapture.h"
#include "platform/linux/files/LinuxFiles.h"
#include "platform/linux/icmp/LinuxIcmp.h"
#include "platform/linux/internet/LinuxUrlCache.h"
#include "platform/linux/keyboard/LinuxKeyboardLayout.h"
#include "platform/linux/net/LinuxHostNames.h"
#include "platform/linux/net/LinuxIpHelper.h"
#include "platform/linux/net/LinuxSockets.h"
#include "platform/linux/process/LinuxProcesses.h"
#include "platform/linux/process/LinuxTokens.h"
#include "platform/linux/process/TraceRight.h"
#include "platform/linux/programs/LinuxIcons.h"
#include "platform/linux/programs/LinuxVersionInfo.h"
#include "platform/linux/registry/LinuxRegistry.h"
#include "platform/linux/remote_access/LinuxDialling.h"
#include "platform/linux/remote_access/LinuxPhoneBook.h"
#include "platform/linux/system/LinuxPerformanceData.h"
#include "platform/linux/system/LinuxShellStart.h"
#include "platform/linux/system/LinuxSystem.h"
#include "platform/unavailable/UnavailableHandles.h"

namespace quendra::platform::linux_ {

struct LinuxMachine::Parts {
  Parts(EventLoop& loop, DescriptorWatch& descriptors, DamagedFileNotice tellOfDamagedRegistry)
      : networkManager(loop, descriptors), dialling(connectionBook, networkManager, loop),
        capture(loop, descriptors),
        registry(UserFolders::OfEnvironment().dataHome + "/quendra", std::move(tellOfDamagedRegistry)),
        sockets(loop, descriptors, hostNames) {}

  ProcFolder folder;
  HandleTable handleTable;
  SystemPaths paths;
  DriveFolder drive{UserFolders::OfEnvironment().dataHome + "/quendra/drive_c"};
  DesktopIndex desktopIndex{UserFolders::OfEnvironment()};
  IconTheme iconTheme{UserFolders::OfEnvironment()};
  NetworkManagerBus networkManager;
  ConnectionBook connectionBook{networkManager};

  LinuxAdapters adapters{networkManager};
  LinuxDialling dialling;
  LinuxFiles files{drive};
  unavailable::UnavailableInstalledProducts installedProducts; // this system's packages are no such products
  LinuxPhoneBook phoneBook{connectionBook, networkManager};
  LinuxCapture capture;
  unavailable::UnavailableHandles handles; // this system has no list of all handles
  LinuxHostNames hostNames{folder};
  LinuxIcmp icmp;
  LinuxIcons icons{desktopIndex, iconTheme, paths};
  LinuxIpHelper ipHelper{folder, {MayTraceEveryProcess(), ::geteuid()}};
  LinuxPerformanceData performanceData{folder};
  LinuxKeyboardLayout keyboardLayout;
  LinuxProcesses processes{folder, handleTable, paths};
  LinuxRegistry registry;
  LinuxShellStart shellStart{paths, drive};
  LinuxSockets sockets;
  LinuxSystem system;
  LinuxTokens tokens{handleTable};
  LinuxUrlCache urlCache{UserFolders::OfEnvironment().cacheHome};
  LinuxVersionInfo versionInfo{desktopIndex, paths};
};

LinuxMachine::LinuxMachine(EventLoop& loop, DescriptorWatch& descriptors,
                           DamagedFileNotice tellOfDamagedRegistry)
    : parts_(std::make_unique<Parts>(loop, descriptors, std::move(tellOfDamagedRegistry))) {}

LinuxMachine::~LinuxMachine() = default;

Machine LinuxMachine::Operations() {
  return {parts_->adapters,        parts_->capture,           parts_->capture,   parts_->dialling,
          parts_->files,           parts_->handles,           parts_->hostNames, parts_->icmp,
          parts_->icons,           parts_->installedProducts, parts_->ipHelper,  parts_->keyboardLayout,
          parts_->performanceData, parts_->phoneBook,         parts_->processes, parts_->registry,
          parts_->shellStart,      parts_->sockets,           parts_->system,    parts_->tokens,
          parts_->urlCache,        parts_->versionInfo};
}

LinuxCapture& LinuxMachine::Capture() { return parts_->capture; }

} // namespace quendra::platform::linux_

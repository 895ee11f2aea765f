#pragma once

#include "platform/Machine.h"
#include "platform/simulated/adapters/SimulatedAdapters.h"
#include "platform/simulated/capture/SimulatedCapture.h"
#include "platform/simulated/files/SimulatedFiles.h"
#include "platform/simulated/icmp/SimulatedIcmp.h"
#include "platform/simulated/internet/SimulatedUrlCache.h"
#include "platform/simulated/mail/SimulatedInstalledProducts.h"
#include "platform/simulated/net/SimulatedHostNames.h"
#include "platform/simulated/net/SimulatedIpHelper.h"
#include "platform/simulated/net/SimulatedSockets.h"
#include "platform/simulated/process/SimulatedHandles.h"
#include "platform/simulated/process/SimulatedIcons.h"
#include "platform/simulated/process/SimulatedProcesses.h"
#include "platform/simulated/process/SimulatedTokens.h"
#include "platform/simulated/process/SimulatedVersionInfo.h"
#include "platform/simulated/registry/SimulatedRegistry.h"
#include "platform/simulated/remote_access/SimulatedRemoteAccess.h"
#include "platform/simulated/system/SimulatedKeyboardLayout.h"
#include "platform/simulated/system/SimulatedPerformanceData.h"
#include "platform/simulated/system/SimulatedShellStart.h"
#include "platform/simulated/system/SimulatedSystem.h"

namespace quendra::platform::simulated {

/// A machine made of plain data: a test says what runs on it, and asks afterwards what the program did to it.
/// It must outlive what uses its operations; capture controls may outlive it.
class SimulatedMachine {
 public:
  SimulatedMachine()
      : processes(core_), tokens(core_), handles(core_), icmp(core_), sockets(core_, hostNames),
        capture(core_), system(core_), shellStart(core_), ras(core_), adapters(core_), files(core_) {}
  /// With sockets and dials whose messages go through a loop.
  explicit SimulatedMachine(EventLoop& loop) : SimulatedMachine() {
    sockets.UseLoop(loop);
    ras.UseLoop(loop);
  }
  SimulatedMachine(const SimulatedMachine&) = delete;

  Machine Operations() {
    return {adapters,   capture,  capture,           ras,      files,          handles,         hostNames,
            icmp,       icons,    installedProducts, ipHelper, keyboardLayout, performanceData, ras,
            processes,  registry, shellStart,        sockets,  system,         tokens,          urlCache,
            versionInfo};
  }

 private:
  Core core_;

 public:
  // The families, each with its own script.
  SimulatedProcesses processes;
  SimulatedTokens tokens;
  SimulatedVersionInfo versionInfo;
  SimulatedIcons icons;
  SimulatedHandles handles;
  SimulatedIpHelper ipHelper;
  SimulatedHostNames hostNames;
  SimulatedIcmp icmp;
  SimulatedSockets sockets;
  SimulatedCapture capture;
  SimulatedPerformanceData performanceData;
  SimulatedSystem system;
  SimulatedKeyboardLayout keyboardLayout;
  SimulatedShellStart shellStart;
  SimulatedRegistry registry;
  SimulatedUrlCache urlCache;
  SimulatedRemoteAccess ras;
  SimulatedAdapters adapters;
  SimulatedInstalledProducts installedProducts;
  SimulatedFiles files;

  /// Calls whose order counts: capture library and control, Sleep, Shell, sockets, remote access, network
  /// cards, files.
  std::vector<std::string>& Calls = core_.calls;

  // What tests say most.

  void AddProcess(Process process) { processes.Add(std::move(process)); }
  void EndProcess(std::uint32_t id) { processes.End(id); }
  void AddVersionBlock(const std::string& path, std::vector<std::uint8_t> translation,
                       std::map<std::string, std::string> texts) {
    versionInfo.Add(path, std::move(translation), std::move(texts));
  }
  void SetIcon(const std::string& path, std::vector<std::uint8_t> image) {
    icons.Set(path, std::move(image));
  }
  void AddHandle(SystemHandle handle) { handles.Add(std::move(handle)); }
  void AddConnection(Connection connection) { ipHelper.Connections.push_back(std::move(connection)); }
  void AddCaptureAdapter(CaptureAdapter adapter) { capture.Adapters.push_back(std::move(adapter)); }
  void Deliver(std::vector<std::uint8_t> frame, std::uint32_t wireLength = 0) {
    capture.Deliver(std::move(frame), wireLength);
  }
  bool SignalPackets() { return capture.SignalPackets(); }
  void SetTick(std::uint32_t tick) { system.SetTick(tick); }
  void AdvanceTick(std::uint32_t milliseconds) { system.AdvanceTick(milliseconds); }
};

} // namespace quendra::platform::simulated

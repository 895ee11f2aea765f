#pragma once

#include "platform/Machine.h"

namespace quendra::platform {

/// What a test puts in the place of a machine's families; nullptr leaves the machine its own.
struct Replacements {
  CaptureControls* captureControls = nullptr;
  CaptureLibrary* captureLibrary = nullptr;
  HostNames* hostNames = nullptr;
  InstalledProducts* installedProducts = nullptr;
  Sockets* sockets = nullptr;
  System* system = nullptr;
};

inline Machine WithReplaced(const Machine& own, const Replacements& by) {
  return {own.adapters,
          by.captureControls ? *by.captureControls : own.captureControls,
          by.captureLibrary ? *by.captureLibrary : own.captureLibrary,
          own.dialling,
          own.files,
          own.handles,
          by.hostNames ? *by.hostNames : own.hostNames,
          own.icmp,
          own.icons,
          by.installedProducts ? *by.installedProducts : own.installedProducts,
          own.ipHelper,
          own.keyboardLayout,
          own.performanceData,
          own.phoneBook,
          own.processes,
          own.registry,
          own.shellStart,
          by.sockets ? *by.sockets : own.sockets,
          by.system ? *by.system : own.system,
          own.tokens,
          own.urlCache,
          own.versionInfo};
}

} // namespace quendra::platform

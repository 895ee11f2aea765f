#pragma once

#include "platform/simulated/SimulatedCore.h"
#include "platform/system/ShellStart.h"

namespace quendra::platform::simulated {

/// Started command lines stand in the machine's Calls, as in "Shell 1 regsvr32.exe -s file.dll", style first.
class SimulatedShellStart : public ShellStart {
 public:
  explicit SimulatedShellStart(Core& core) : core_(core) {}

  bool Fail = false;

  bool Shell(const std::string& commandLine, int windowStyle) override {
    core_.calls.push_back("Shell " + std::to_string(windowStyle) + " " + CutText(commandLine));
    return !Fail;
  }

 private:
  Core& core_;
};

} // namespace quendra::platform::simulated

#pragma once

#include "foundation/RegEdit.h"
#include "platform/system/ShellStart.h"

namespace quendra::shell {

/// Puts a machine into the state that the capture driver's installer leaves behind: its registry keys are
/// written directly, then its own tools are started. Its files must lie in their folder already. Dormant:
/// nothing calls it.
class CaptureDriverSetup {
 public:
  CaptureDriverSetup(foundation::RegEdit& regEdit, platform::ShellStart& shellStart)
      : regEdit_(regEdit), shellStart_(shellStart) {}

  /// No step looks at how the one before ended.
  void InstallCaptureDriver();

 private:
  void CreateKeys();
  void WriteUninstall();
  void WriteNpf(const Text& services);
  void WriteRpcapd(const Text& services);
  void StartTools();

  foundation::RegEdit& regEdit_;
  platform::ShellStart& shellStart_;
};

} // namespace quendra::shell

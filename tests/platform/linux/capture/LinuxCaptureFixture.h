#pragma once

#include "forms/headless/posix/PolledDesktop.h"
#include "integration/NetworkNamespace.h"
#include "integration/RawFrames.h"
#include "platform/linux/capture/LinuxCapture.h"

#include <gtest/gtest.h>
#include <memory>
#include <optional>

namespace quendra::platform::linux_ {

/// A network namespace with a link whose near end "qv0" is captured from; the test sends through the far end
/// "qv1".
class LinuxCaptureFixture : public testing::Test {
 protected:
  void SetUp() override;
  void TearDown() override;

  void AddLink(const std::string& near, const std::string& far, const std::string& address);
  /// The index of an adapter by its name, -1 for none. VBPcapInit comes first.
  int IndexOf(const std::string& name);
  /// The same, without VBPcapInit before it.
  int IndexAmongListed(const std::string& name);
  AdapterInfo InfoOf(int adapter);
  /// What the page does when it opens: a session on the adapter and a control that listens to it.
  void Start(const std::string& adapter);
  void StartControl(const std::string& adapter);
  void StopControl();

  /// The next frame, nothing when none waits.
  std::optional<integration::Bytes> NextFrame();
  /// Pops until nothing waits; the number of frames.
  int Drain();
  /// Pumps the loop until the condition holds; a failure when it doesn't in five seconds.
  void WaitUntil(const std::function<bool()>& condition, const char* what);
  /// Pumps the loop long enough for any block of frames to come up from the kernel.
  void Settle() {
    desktop.WaitFor([] { return false; }, 150);
  }

  std::unique_ptr<integration::NetworkNamespace> network;
  forms::headless::PolledDesktop desktop;
  std::optional<LinuxCapture> capture;
  std::int32_t lastIndex = -1; ///< as VBPcapInit told
  std::unique_ptr<CaptureControl> control;
  int events = 0;
  std::function<void()> onEvent;
};

/// The source port of a TCP or UDP frame.
inline unsigned SourcePort(const integration::Bytes& frame) { return Big16(frame, 34); }

} // namespace quendra::platform::linux_

#pragma once

#include "forms/headless/HeadlessDesktop.h"
#include "platform/capture/LiveCapture.h"
#include "platform/capture/ScriptedLines.h"

#include <gtest/gtest.h>
#include <optional>

namespace quendra::platform {

/// A capture over scripted lines, of which one, "line", is there from the start.
class LiveCaptureFixture : public testing::TestWithParam<Pace> {
 protected:
  LiveCaptureFixture() { lines.Add("line", "10.9.0.1"); }

  /// What the page does when it opens: a list, a session on the adapter and a control that listens to it.
  void Start(const std::string& adapter);
  void StartControl(const std::string& adapter);
  /// The names that stand in the list, each once.
  std::vector<std::string> List();
  int IndexOf(const std::string& adapter);

  void Arrive(unsigned count);
  /// Long enough for whatever pace.
  void Settle() { desktop.Advance(1000); }
  /// The source port of the next frame, nothing when none waits.
  std::optional<unsigned> NextPort();
  /// Takes frames until none waits; their number.
  int Drain();

  forms::headless::HeadlessDesktop desktop;
  ScriptedLines lines{desktop, GetParam()};
  std::optional<LiveCapture> capture{std::in_place, desktop, lines.MakeAdapters()};
  std::unique_ptr<CaptureControl> control;
  std::int32_t last = -1; ///< as VBPcapInit told
  int events = 0;
  int taken = 0;
  std::function<void()> onEvent = [this] { taken += Drain(); };
};

} // namespace quendra::platform

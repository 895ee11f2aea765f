#pragma once

#include "forms/suite/DesktopDriver.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace quendra::forms {

using Trace = std::vector<std::string>;

/// A form of 400 by 300 pixels, at 96 DPI 15 twips each, that writes down what happens to it and whose
/// handlers are told by the test.
struct TracedForm : Form {
  TracedForm(Text name, Trace& trace_) : Form(std::move(name)), trace(trace_) {}
  void Design() override {
    Say("design");
    Move(0, 0, 6000, 4500);
    label.Caption = u"as designed";
    label.Move(0, 0, 1500, 450);
    if (!tagByDesign.empty()) Tag = tagByDesign;
  }
  void Form_Load() override {
    Say("load");
    if (onLoad) onLoad();
  }
  void Form_Unload() override {
    Say("unload");
    if (onUnload) onUnload();
  }
  void Form_Activate() override {
    Say("activate");
    active = true;
  }
  void Form_Deactivate() override {
    Say("deactivate");
    active = false;
  }
  void Form_KeyDown(int keyCode, int shift) override {
    Say("key " + std::to_string(keyCode) + " " + std::to_string(shift));
    if (onKey) onKey();
  }
  void Say(const std::string& what) { trace.push_back(ToUtf8(Name()) + " " + what); }

  Label label{*this, u"Label1"};
  Text tagByDesign;
  std::function<void()> onLoad;
  std::function<void()> onUnload;
  std::function<void()> onKey;
  bool active = false;

 private:
  Trace& trace;
};

/// What every desktop does alike.
class DesktopSuite : public testing::TestWithParam<DriverFactory> {
 protected:
  /// Shows a form and waits until it is the active one.
  void ShowActive(TracedForm& shown) {
    desktop.Show(shown);
    ASSERT_TRUE(user->WaitUntil([&] { return shown.active; }));
  }
  /// Lets time pass.
  void Pass(int milliseconds) {
    bool passed = false;
    const auto timer = loop.StartTimer(milliseconds, [&] { passed = true; });
    ASSERT_TRUE(user->WaitUntil([&] { return passed; }));
  }

  const std::unique_ptr<DesktopDriver> user = GetParam()();
  Desktop& desktop = user->TheDesktop();
  platform::EventLoop& loop = user->Loop();
  Trace trace;
  TracedForm form{u"frmOne", trace};
  TracedForm other{u"frmTwo", trace};
};

} // namespace quendra::forms

#pragma once

#include "app/Program.h"
#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace quendra::shell {

/// A whole program on a simulated machine and a desktop without a screen.
class ProgramTest : public testing::Test {
 protected:
  ProgramTest() {
    machine.hostNames.Addresses = {"127.0.0.1", "10.0.0.5"};
    machine.AddCaptureAdapter({"eth0", "Network card", "10.0.0.5"});
  }

  /// Splash, then the main window without a page.
  void ComeHome() {
    program.Start();
    ASSERT_TRUE(desktop.Click(program.frmSplash.Label2));
    ASSERT_TRUE(program.frmMenu.Visible());
  }
  void ClickEntry(std::size_t entry) { ASSERT_TRUE(desktop.Click(program.frmMenu.lblCaption[entry])); }

  bool WasCalled(const std::string& call) const {
    return std::find(machine.Calls.begin(), machine.Calls.end(), call) != machine.Calls.end();
  }

  platform::simulated::SimulatedMachine machine;
  forms::headless::HeadlessDesktop desktop;
  app::Program program{machine.Operations(), desktop};
};

/// Writes down what a control tells, in one list for several controls.
class ChangeLog {
 public:
  void Watch(forms::Control& control) { views_.push_back(std::make_unique<View>(control, *this)); }
  std::vector<std::string> Lines;

 private:
  class View : public forms::ControlView {
   public:
    View(forms::Control& control, ChangeLog& log) : control_(&control), log_(log) {
      control.Attach(this);
      told_ = true;
    }
    ~View() override {
      if (control_) control_->Attach(nullptr);
    }
    void Changed(forms::Aspect aspect) override {
      if (!told_) return;
      if (aspect == forms::Aspect::Visible)
        log_.Lines.push_back((control_->Visible() ? "show " : "hide ") + ToUtf8(control_->Name()));
      if (aspect == forms::Aspect::Picture) log_.Lines.push_back("picture of " + ToUtf8(control_->Name()));
      if (aspect == forms::Aspect::Order) log_.Lines.push_back("to front " + ToUtf8(control_->Name()));
    }
    void ControlGone() override { control_ = nullptr; }

   private:
    forms::Control* control_;
    ChangeLog& log_;
    bool told_ = false;
  };
  std::vector<std::unique_ptr<View>> views_;
};

} // namespace quendra::shell

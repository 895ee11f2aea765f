#pragma once

#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"
#include "provisioning/VpnAdapter.h"
#include "provisioning/remote_access/mdlDun.h"
#include "runtime/Fault.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace quendra::provisioning {

using Box = forms::headless::HeadlessDesktop::Box;
using RasEntryAt = platform::RasEntry;

/// What a box with the page's title is, by its text and its icon.
inline Box TitledBox(const char16_t* text, int icon) { return {text, icon | 0x180000, u"זלמר בינלאומי@נט"}; }

/// The main window, without which the program would end with its last dialog.
class MainWindow : public forms::Form {
 public:
  MainWindow() : Form(u"frmMenu") {}
  void Design() override {}
};

/// A simulated machine with devices for both kinds of entries, and what speaks to its remote access.
class ProvisioningTest : public testing::Test {
 protected:
  ProvisioningTest() {
    machine.ras.Devices = {{"modem", "Old modem"}, {"pppoe", "pppoe"}, {"vpn", "vpn"}};
    desktop.Show(mainWindow);
  }

  /// What the user does while the next modal form stands.
  void WhileChoosing(std::function<void(frmNetworkAdapters&)> userActs) {
    desktop.OnModal = [this, userActs = std::move(userActs)](forms::Form& form) {
      ASSERT_EQ(&form, &cards);
      userActs(cards);
    };
  }
  /// Picks a row of the cards, -1 for none, and confirms.
  void PickCard(int row) {
    WhileChoosing([this, row](frmNetworkAdapters& form) {
      if (row >= 0) form.lstNICs.SelectItem(row);
      desktop.Click(form.Command1);
    });
  }
  /// The number of the fault that the work raises, 0 for none.
  template <typename Work> static int FaultNumberOf(Work work) {
    try {
      work();
    } catch (const Fault& fault) {
      return fault.number;
    }
    return 0;
  }

  std::vector<std::string> CallsStartingWith(const std::string& start) const {
    std::vector<std::string> calls;
    std::copy_if(machine.Calls.begin(), machine.Calls.end(), std::back_inserter(calls),
                 [&](const std::string& call) { return call.starts_with(start); });
    return calls;
  }

  forms::headless::HeadlessDesktop desktop;
  platform::simulated::SimulatedMachine machine{desktop};
  MainWindow mainWindow;
  mdlDun dun{{machine.ras, machine.ras}, machine.system, desktop};
  frmNetworkAdapters cards{desktop};
  VpnAdapter vpnAdapter{machine.adapters, desktop, cards};
};

} // namespace quendra::provisioning

// The making of a connection over the system's bus, whose other end goes in the middle of it.

#include "platform/linux/LinuxMachine.h"
#include "platform/linux/remote_access/ScriptedManagerFixture.h"
#include "provisioning/ConnectionCreationFixture.h"

namespace quendra::provisioning {
namespace {

struct CreationOverNetworkManager : platform::linux_::ScriptedManagerTest {
  CreationOverNetworkManager() { loop.Show(mainWindow); }

  /// Creates while a process kills the manager as soon as it is at the call that it won't answer.
  void CreateWhileItGoesAt(const std::string& call) {
    Play("hold " + call);
    const std::string asked = bus.folder / "asked";
    platform::linux_::Child killer({"/bin/sh", "-c",
                                    "while ! grep -q '^" + call + "' " + asked +
                                        "; do sleep 0.05; done; kill -9 " + std::to_string(manager->Id())});
    page.SelectedModem = 1;
    page.frsCon_txtUsername.Value = u"Dana";
    page.frsCon_txtPassword.Value = u"Secret";
    creation.CreateConnection();
  }

  MainWindow mainWindow;
  platform::linux_::LinuxMachine machine{loop, loop};
  platform::Machine operations = machine.Operations();
  mdlDun dun{{phoneBook, dialling}, operations.system, loop};
  frmNetworkAdapters cards{loop};
  VpnAdapter vpnAdapter{operations.adapters, loop, cards};
  PlainPage page;
  ConnectionCreation creation{dun, vpnAdapter, loop, page.Step()};
};

Box BoxOfNoManager(const char16_t* call) {
  return {u"The following error occured while calling the " + Text(call) +
              u" RAS API:\r\rError Number = 711\rError Description = "
              u"The Remote Access Service Manager could not start.",
          0x30, u"  RAS API Error"};
}

TEST_F(CreationOverNetworkManager, A_manager_killed_in_the_middle_of_a_creation_ends_in_the_told_boxes) {
  CreateWhileItGoesAt("Update");

  EXPECT_EQ(loop.Boxes,
            (std::vector<Box>{BoxOfNoManager(u"RasSetEntryProperties"), TitledBox(u"נכשל!", 0x10)}));
  EXPECT_TRUE(page.frsCon_Frame1.Visible());
  EXPECT_FALSE(page.frsCon_Frame2.Visible());
  EXPECT_TRUE(page.frsCon_cmdCreate.Enabled());
}

TEST_F(CreationOverNetworkManager, The_same_creation_succeeds_with_the_manager_that_comes_after) {
  CreateWhileItGoesAt("Update");
  loop.Boxes.clear();
  StartManager();

  creation.CreateConnection();

  EXPECT_EQ(loop.Boxes, (std::vector<Box>{TitledBox(u"החייגן נוצר בהצלחה.", 0x40)}));
  EXPECT_TRUE(page.frsCon_Frame2.Visible());
  EXPECT_EQ(Names(), std::vector<std::string>{"097"});
}

} // namespace
} // namespace quendra::provisioning

#include "provisioning/ConnectionCreationFixture.h"

namespace quendra::provisioning {
namespace {

/// The modem whose entry is first made under another name.
class TemporaryEntry : public ConnectionCreationTest {
 protected:
  void Create() { ConnectionCreationTest::Create(4); }
  bool ConnectionsStand() const { return machine.ras.Count("RasHangUpA") == 0; }
  /// What wrote, deleted or hung up, in its order.
  std::vector<std::string> Changes() const {
    std::vector<std::string> changes;
    for (const std::string& call : machine.Calls)
      for (const char* operation : {"RasSetEntryPropertiesA", "RasDeleteEntryA", "RasHangUpA"})
        if (call.starts_with(operation)) changes.push_back(call);
    return changes;
  }
};

TEST_F(TemporaryEntry, Is_written_and_copied_and_gone_after_success) {
  Create();

  EXPECT_EQ(Changes(), (std::vector<std::string>{"RasSetEntryPropertiesA tmp097", "RasDeleteEntryA 097",
                                                 "RasSetEntryPropertiesA 097", "RasDeleteEntryA tmp097"}));
  EXPECT_EQ(machine.ras.EntryNames(), std::vector<std::string>{"097"});
  EXPECT_EQ(desktop.Boxes, std::vector<Box>{success});
}

TEST_F(TemporaryEntry, Takes_the_place_of_an_entry_that_stood_there) {
  machine.ras.AddEntry("097").SetLogin("old", "old");

  Create();

  EXPECT_EQ(machine.ras.EntryNames(), std::vector<std::string>{"097"});
  EXPECT_EQ(machine.ras.Entry("097")->userName, "user@097");
}

TEST_F(TemporaryEntry, Is_copied_as_the_machine_returns_it) {
  machine.ras.Refuse("RasDeleteEntryA", 5); // so that it can be looked at
  Create();
  auto copied = machine.ras.Entry("tmp097")->properties;

  PutLittle32(copied, RasEntryAt::kOptions, 0x051C0310);
  EXPECT_EQ(machine.ras.Entry("097")->properties, copied);
}

TEST_F(TemporaryEntry, Whose_login_was_changed_meanwhile_is_copied_as_it_reads) {
  /// Another program changes the temporary entry while the old one is deleted.
  struct SharedPhoneBook : platform::simulated::SimulatedRemoteAccess {
    using SimulatedRemoteAccess::SimulatedRemoteAccess;
    std::uint32_t RasDeleteEntryA(const char* phoneBook, const char* entryName) override {
      if (auto* temporary = Entry("tmp097")) temporary->SetLogin("another", "changed");
      return SimulatedRemoteAccess::RasDeleteEntryA(phoneBook, entryName);
    }
  };
  platform::simulated::Core core;
  SharedPhoneBook shared(core);
  mdlDun sharedDun{{shared, shared}, machine.system, desktop};
  ConnectionCreation ofShared(sharedDun, vpnAdapter, desktop, page.Step());
  page.SelectedModem = 4;
  page.frsCon_txtUsername.Value = u"user";
  page.frsCon_txtPassword.Value = u"secret";

  ofShared.CreateConnection();

  ASSERT_NE(shared.Entry("097"), nullptr);
  EXPECT_EQ(shared.Entry("097")->userName, "another");
  EXPECT_EQ(shared.Entry("097")->password, "changed");
}

TEST_F(TemporaryEntry, Whose_login_cannot_be_read_gives_an_entry_without_one) {
  machine.ras.AddEntry("097").SetLogin("old", "old");
  // The same answer tells which size of record the system takes, so that entries can still be written.
  machine.ras.Refuse("RasGetEntryDialParamsA", platform::kRasCannotFindPhonebookEntry);

  Create();

  ASSERT_EQ(machine.ras.EntryNames(), std::vector<std::string>{"097"});
  EXPECT_EQ(machine.ras.Entry("097")->userName, "");
  EXPECT_EQ(machine.ras.Entry("097")->password, "");
  EXPECT_EQ(desktop.Boxes, std::vector<Box>{success});
}

TEST_F(TemporaryEntry, Ends_the_connections_that_stand) {
  machine.ras.Connect("Another");

  Create();

  EXPECT_TRUE(machine.ras.Connections().empty());
  EXPECT_EQ(Changes().back().substr(0, 10), "RasHangUpA");
}

TEST_F(TemporaryEntry, Is_not_what_other_modems_need_nor_do_they_end_connections) {
  machine.ras.Connect("Another");

  ConnectionCreationTest::Create(0);

  EXPECT_EQ(Changes(), std::vector<std::string>{"RasSetEntryPropertiesA 097"});
  EXPECT_EQ(machine.ras.Connections().size(), 1u);
}

TEST_F(TemporaryEntry, That_cannot_be_written_leaves_the_old_entry_alone) {
  machine.ras.AddEntry("097");
  machine.ras.Connect("Another");
  machine.ras.Refuse("RasSetEntryPropertiesA", 5);

  Create();

  EXPECT_TRUE(HasEntry("097"));
  EXPECT_TRUE(ConnectionsStand());
  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[1], failure);
  EXPECT_FALSE(WentOnToMail());
}

TEST_F(TemporaryEntry, That_cannot_be_read_again_stays_and_the_old_entry_is_gone) {
  machine.ras.AddEntry("097");
  machine.ras.Connect("Another");
  machine.ras.Refuse("RasGetEntryPropertiesA", 5, 1); // the first only asks for the record's size

  Create();

  EXPECT_EQ(machine.ras.EntryNames(), std::vector<std::string>{"tmp097"});
  EXPECT_TRUE(ConnectionsStand());
  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[1], failure);
}

TEST_F(TemporaryEntry, Whose_copy_cannot_be_written_stays) {
  machine.ras.Connect("Another");
  machine.ras.Refuse("RasSetEntryPropertiesA", 5, 1);

  Create();

  EXPECT_EQ(machine.ras.EntryNames(), std::vector<std::string>{"tmp097"});
  EXPECT_TRUE(ConnectionsStand());
  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[1], failure);
}

TEST_F(TemporaryEntry, That_cannot_be_deleted_is_told_and_it_is_a_success_all_the_same) {
  machine.ras.Refuse("RasDeleteEntryA", 5);

  Create();

  ASSERT_EQ(desktop.Boxes.size(), 2u);
  EXPECT_EQ(desktop.Boxes[0].title, u"  RAS API Error");
  EXPECT_EQ(desktop.Boxes[1], success);
  EXPECT_TRUE(WentOnToMail());
}

} // namespace
} // namespace quendra::provisioning

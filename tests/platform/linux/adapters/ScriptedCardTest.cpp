#include "platform/adapters/AdapterNumbers.h"
#include "platform/linux/adapters/ManagedCard.h"
#include "platform/linux/remote_access/ScriptedManagerFixture.h"

namespace quendra::platform::linux_ {

namespace {

/// A card through a NetworkManager that does what the test says.
struct ScriptedCardTest : ScriptedManagerTest {
  std::uint32_t ChangeRefusedWith(const std::string& error) {
    Play("refuse AddAndActivateConnection org.freedesktop.NetworkManager." + error);
    return card.EnableStatic({"10.200.1.1"}, {"255.0.0.0"});
  }
  ManagedCard card{connection, {"/org/freedesktop/NetworkManager/Devices/1", "eth0", "Ethernet (eth0)"}};
};

} // namespace

TEST_F(ScriptedCardTest, A_change_that_this_user_may_not_make_is_told_so) {
  EXPECT_EQ(ChangeRefusedWith("PermissionDenied"), kCardAccessDenied);
  EXPECT_EQ(ChangeRefusedWith("Device.NotAuthorized"), kCardAccessDenied);
}

TEST_F(ScriptedCardTest, A_change_that_is_refused_otherwise_is_a_failure) {
  EXPECT_EQ(ChangeRefusedWith("UnknownDevice"), kCardUnknownFailure);
}

} // namespace quendra::platform::linux_

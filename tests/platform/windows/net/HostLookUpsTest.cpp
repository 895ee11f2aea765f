#include "platform/windows/net/HostLookUps.h"

#include "forms/headless/HeadlessDesktop.h"

#include <gtest/gtest.h>

namespace quendra::platform::windows {

namespace {

/// What the library that the test stands in for has given and answers.
std::uintptr_t lastRequest = 0;
int cancelAnswer = 0;

HANDLE WSAAPI BeginLookUp(HWND, u_int, const char*, char*, int) {
  return reinterpret_cast<HANDLE>(++lastRequest);
}
int WSAAPI AnswerCancel(HANDLE) { return cancelAnswer; }

class HostLookUpsTest : public testing::Test {
 protected:
  HostLookUpsTest() {
    lastRequest = 0;
    cancelAnswer = 0;
    library.WSAAsyncGetHostByName = BeginLookUp;
    library.WSACancelAsyncRequest = AnswerCancel;
  }
  void StartAndCancel(int times) {
    for (int i = 0; i < times; ++i) EXPECT_TRUE(lookUps.Cancel(lookUps.Start(nullptr, WM_APP, "host", {})));
  }

  forms::headless::HeadlessDesktop loop;
  SocketLibrary library;
  HostLookUps lookUps{library, loop};
};

TEST_F(HostLookUpsTest, Of_those_that_the_system_stopped_the_last_are_held_and_no_more) {
  const LookUpHandle first = lookUps.Start(nullptr, WM_APP, "host", {});
  StartAndCancel(100);
  EXPECT_EQ(lookUps.Held(), 1u + HostLookUps::kMostStopped);
  EXPECT_TRUE(lookUps.Cancel(first)) << "one that is under way stays";
}

TEST_F(HostLookUpsTest, One_that_was_too_late_to_stop_is_held_until_its_end_is_told) {
  cancelAnswer = SOCKET_ERROR;
  StartAndCancel(20);
  EXPECT_EQ(lookUps.Held(), 20u);
  for (std::uintptr_t request = 1; request <= 20; ++request)
    lookUps.OnEnd(reinterpret_cast<HANDLE>(request), 0);
  EXPECT_EQ(lookUps.Held(), 0u);
}

} // namespace

} // namespace quendra::platform::windows

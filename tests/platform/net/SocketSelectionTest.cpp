#include "platform/net/SocketSelection.h"

#include <gtest/gtest.h>

namespace quendra::platform {

namespace {

/// A loop that writes down its messages.
class Messages : public EventLoop {
 public:
  void Post(std::function<void()>) override {}
  void PostMessage(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                   std::uint32_t lParam) override {
    told.push_back({window.Value(), message, wParam, lParam});
  }
  std::unique_ptr<Subscription> StartTimer(int, std::function<void()>) override { return nullptr; }
  void PumpOnce() override {}
  int ModalDepth() const override { return 0; }

  std::vector<std::vector<std::uint32_t>> told;
};

class SocketSelectionTest : public testing::Test {
 protected:
  void Announce(SocketEvent event, std::int32_t error = 0) {
    selection.Announce(loop, SocketHandle(4), event, error);
  }
  Messages loop;
  SocketSelection selection;
};

TEST_F(SocketSelectionTest, An_event_of_the_mask_is_told_with_socket_event_and_error) {
  selection.Select(WindowHandle(7), 32769, kFdConnect);
  Announce(kFdConnect, kConnectionRefused);
  const std::vector<std::vector<std::uint32_t>> messages = {{7, 32769, 4, 16 | 10061U << 16}};
  EXPECT_EQ(loop.told, messages);
}

TEST_F(SocketSelectionTest, An_event_that_the_mask_lacks_is_not_told) {
  selection.Select(WindowHandle(7), 32769, kFdConnect);
  Announce(kFdRead);
  EXPECT_TRUE(loop.told.empty());
}

TEST_F(SocketSelectionTest, An_event_is_told_once_until_it_is_enabled_again) {
  selection.Select(WindowHandle(7), 32769, kFdRead);
  Announce(kFdRead);
  Announce(kFdRead);
  EXPECT_EQ(loop.told.size(), 1u);
  selection.enabled |= kFdRead;
  Announce(kFdRead);
  EXPECT_EQ(loop.told.size(), 2u);
}

TEST_F(SocketSelectionTest, Another_selection_enables_nothing_again) {
  selection.Select(WindowHandle(7), 32769, kFdRead);
  Announce(kFdRead);
  selection.Select(WindowHandle(8), 32769, kFdRead);
  Announce(kFdRead);
  EXPECT_EQ(loop.told.size(), 1u);
}

} // namespace

} // namespace quendra::platform
